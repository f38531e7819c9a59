// Length of sets of texts, for each class of integers.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

// Integers by their text forms.
template <class Integer>
Integer Made(const char* form) {
  Integer n;
  ZORistrstream in(form, 0);
  n.InputValue(in);
  return n;
}

template <class Integer>
void CheckLength(const char* set, const char* before, int answer, const char* after, int again) {
  const HeldSet held(set);
  Integer n = Made<Integer>(before);
  for (const int expected : {answer, again}) {
    EXPECT_EQ(held.value.CalcLength(n), expected) << set << ' ' << before;
    EXPECT_EQ(Printed(n), after) << set << ' ' << before;
  }
  EXPECT_EQ(held.Now(), Set(set));
}

TEST(EnumLength, Forward) {
  CheckLength<ZORVadEnumInteger>("{,ab,cd}", "Any", 1, "{ 0, 2 }", 0);
  CheckLength<ZORVadEnumInteger>("{,ab,cd,Max}", "{ 2, 3 }", 1, "{ 2 }", 0);
  CheckLength<ZORVadIntervalInteger>("{,ab,cd}", "1..9", 1, "2", 0);
  CheckLength<ZORVadSingleInteger>("{,ab,cd}", "2", 0, "2", 0);
  CheckLength<ZORVadSingleInteger>("{ab,cd}", "Any", 1, "2", 0);
  CheckLength<ZORVadSingleInteger>("{ab,cd}", "3", 1, "Nil", 0);
  CheckLength<ZORVadEnumInteger>("Min", "Any", 1, "{ 0 }", 0);
  CheckLength<ZORVadEnumInteger>("Max", "Any", 1, "Nil", 0);
  CheckLength<ZORVadSingleInteger>("Any", "3", 1, "Any", 1);
  CheckLength<ZORVadIntervalInteger>("Nil", "Nil", 1, "Nil", 1);
}

template <class Integer>
void CheckInverseLength(const Set& set, const char* length, int answer, const Set& after, int again) {
  HeldSet held(set);
  const Integer n = Made<Integer>(length);
  for (const int expected : {answer, again}) {
    EXPECT_EQ(held.Abstract().CalcInverseLength(n), expected) << set << ' ' << length;
    EXPECT_EQ(held.Now(), after) << set << ' ' << length;
  }
}

TEST(EnumLength, Inverse) {
  CheckInverseLength<ZORVadSingleInteger>("{a,ab,cd}", "2", 1, "{ab,cd}", 1);
  CheckInverseLength<ZORVadSingleInteger>("{a,ab,cd}", "3", 1, "Nil", 0);
  CheckInverseLength<ZORVadIntervalInteger>("{,a,ab,abc}", "1..2", 1, "{a,ab}", 1);
  CheckInverseLength<ZORVadIntervalInteger>("{,a,ab}", "-1..0", 1, "Min", 1);
  CheckInverseLength<ZORVadEnumInteger>("{,a,ab}", "{ 0, 2 }", 1, "{,ab}", 1);
  CheckInverseLength<ZORVadSingleInteger>("{a,Max}", "1", 1, "{a}", 1);
  CheckInverseLength<ZORVadSingleInteger>("Max", "255", 1, "Nil", 0);
  CheckInverseLength<ZORVadSingleInteger>("{a}", "-1", 1, "Nil", 0);
  CheckInverseLength<ZORVadSingleInteger>("{a}", "Nil", 1, "Nil", 0);
  CheckInverseLength<ZORVadSingleInteger>("Any", "Nil", 1, "Nil", 0);
  CheckInverseLength<ZORVadSingleInteger>("Any", "-1", 0, "Any", 0);
  CheckInverseLength<ZORVadSingleInteger>("Nil", "1", 0, "Nil", 0);
  CheckInverseLength<ZORVadSingleInteger>("{a,Max}", "Any", 0, "{a,Max}", 0);
  CheckInverseLength<ZORVadIntervalInteger>(Many(256), "1..9", 1, Many(256), 1);
  CheckInverseLength<ZORVadIntervalInteger>(Many(257), "1..9", 1, "Any", 0);
  CheckInverseLength<ZORVadSingleInteger>(Many(300), "2", 1, Many(10), 1);
}

}  // namespace
}  // namespace zor::test
