// Construction and copies of sets of texts, and examples of their operations.
#include <gtest/gtest.h>

#include "tests/support/examples.h"

namespace zor::test {
namespace {

// clang-format off
const Example kExamples[] = {  // why, operation, operands, answer, target afterwards
  {"the target's max stays",                 "CalcEqualValue", {"{a,b,Max}", "{a,b}"}, 0, "{a,b,Max}"},
  {"two max meet in no text",                "CalcEqualValue", {"{a,Max}", "{b,Max}"}, 1, "Nil"},
  {"the operand's max takes no part",        "CalcEqualValue", {"{a,b}", "{a,Max}"}, 1, "{a}"},
  {"the bound of min is one space",          "CalcLessValue", {"Min", "{ }"}, 1, "Nil"},
  {"nothing is cut",                         "CalcInverseNotLessAndUnequalValue", {"{m}", "{a,z}"}, 1, "Nil"},
  {"the union from the greater bound",       "CalcMaxValue", {"Any", "{a,c}", "{b,d}"}, 1, "{b,c,d}"},
  {"two least texts make one space",         "CalcMaxValue", {"Any", "Min", "Min"}, 1, "{ }"},
  {"an open operand tells an entry nothing", "CalcMaxValue", {"{a}", "Max", "Any"}, 0, "{a}"},
  {"the union up to the lesser bound",       "CalcMinValue", {"Any", "{a,c}", "{b,d}"}, 1, "{a,b,c}"},
  {"a space is added, z is replaced",        "CalcNextValue", {"{q}", "{ab,Max}"}, 1, "{ab }"},
  {"filled with z, one for two",             "CalcInverseNextValue", {"{ab ,ac}", "{q}"}, 1, "{abz*253}"},
  {"met with what z holds",                  "CalcConcatenation", {"{ad,x,Max}", "{a,b}", "{c,d}"}, 1, "{ad,Max}"},
  {"no limit of length",                     "CalcConcatenation", {"Any", "{a*200}", "{b*200}"}, 1, "{a*200b*200}"},
  {"what is no fold goes",                   "CalcLowerValue", {"{a,c,Max}", "{A,B,Max}"}, 1, "{a,Max}"},
  {"text by text, in another order",         "CalcInverseLowerValue", {"{a,b}", "{B,a}"}, 1, "Nil"},
};

// Lengths into and from every class of integer, as text forms: of the set, the integer, and what becomes of either.
const struct {
  Set z;
  const char *interval, *numbers;
  const char *intervalAfter, *numbersAfter;  // of CalcLength
  Set ofInterval, ofNumbers;                 // of CalcInverseLength
} kLengths[] = {
  {"{,ab,cd,Max}", "1..9",  "{ 2, 3 }", "2",   "{ 2 }",    "{ab,cd}", "{ab,cd}"},
  {"{a,ab,abc}",   "-1..0", "{ 1, 3 }", "Nil", "{ 1, 3 }", "Nil",     "{a,abc}"},
  {"{,a}",         "-1..0", "{ 0, 2 }", "0",   "{ 0 }",    "Min",     "Min"},
  {"Max",          "Any",   "Any",      "Nil", "Nil",      "Max",     "Max"},
  {"Any",          "2..3",  "{ 2, 3 }", "Any", "Any",      "Any",     "Any"},
  {"Nil",          "2..3",  "{ 2, 3 }", "Nil", "Nil",      "Nil",     "Nil"},
  {"{a,b}",        "Nil",   "Nil",      "Nil", "Nil",      "Nil",     "Nil"},
};
// clang-format on

TEST(EnumState, Examples) {
  for (const Example& example : kExamples) CheckExample<Set>(example);
}

template <class Integer>
void CheckLengths(const Set& z, const char* form, const char* after, const Set& narrowed) {
  HeldSet held(z);
  ZORistrstream in(form, 0);
  Integer length, tried;
  length.InputValue(in);
  tried.Assign(length);
  held.value.CalcLength(tried);
  std::ostringstream told;
  told << tried;
  EXPECT_EQ(told.str(), after) << z << form;
  held.value.CalcInverseLength(length);
  EXPECT_EQ(held.Now(), narrowed) << z << form;
}

TEST(EnumState, LengthsOfOtherClasses) {
  for (const auto& row : kLengths) {
    CheckLengths<ZORVadIntervalInteger>(row.z, row.interval, row.intervalAfter, row.ofInterval);
    CheckLengths<ZORVadEnumInteger>(row.z, row.numbers, row.numbersAfter, row.ofNumbers);
  }
}

TEST(EnumState, Construction) {
  EXPECT_EQ(Of(ZORVadEnumString()), Set("Any"));
  EXPECT_EQ(Of(ZORVadEnumString(ZORString("ab"))), Set("{ab}"));
  EXPECT_EQ(Of(ZORVadEnumString(static_cast<const void*>("ab"))), Set("{ab}"));
  for (const char* z : {"{a,b,Max}", "Any{a,a}", "Max", "Nil"})
    EXPECT_EQ(Of(ZORVadEnumString(HeldSet(z).value)), Set(z));
  EXPECT_EQ(Of(ZORVadEnumString(HeldSet("{a,a}").value)), Set("{a}")) << "a copy lists each text once";
  for (const auto& [single, set] : std::initializer_list<std::pair<Str, Set>>{
           {"abc", "{abc}"}, {kMin, "{ }"}, {kMax, "Max"}, {Str(kAnyTag, "a"), "Any"}, {Str(kNilTag, "a"), "Nil"}})
    EXPECT_EQ(Of(ZORVadEnumString(HeldSingle(single).value)), set);
}

// Assigning a value to itself changes nothing, in any form; what one value does never shows in another.
TEST(EnumState, Copies) {
  for (const char* notation : {"{a,b,Max}", "{a,a}", "Max", "Nil", "Any{a}"}) {
    HeldSet held(notation);
    const auto objects = held.Objects();
    const auto& same = held.value;
    held.value = same;
    held.value.Assign(same);
    held.value.Copy(same);
    held.Abstract().Assign(same);
    EXPECT_EQ(held.Now(), Set(notation));
    EXPECT_EQ(held.Objects(), objects);
  }
  HeldSet original("{a,b,c}"), assigned("{x}");
  ZORVadEnumString copy(original.value);
  assigned.value = copy;
  copy.GetValue(1) = "bb";
  EXPECT_EQ(Of(copy), Set("{a,bb,c}"));
  EXPECT_EQ(original.Now(), Set("{a,b,c}"));
  EXPECT_EQ(assigned.Now(), Set("{a,b,c}"));
}

// Around the sizes at which the places grow.
TEST(EnumState, Sizes) {
  for (int count = 1; count <= 64; ++count) {
    HeldSet held(Many(count)), merged("{b}");
    EXPECT_EQ(Of(ZORVadEnumString(held.value)), Many(count));
    EXPECT_EQ(merged.value.Append(held.value), 1);
    EXPECT_EQ(merged.value.Count(), count + 1);
  }
}

// The four selections leave the value as it was, any other, like a missing or a single operand, makes it Nil.
TEST(EnumState, Bisect) {
  for (const int selection : {-1, 0, 1, 2, 3, 4}) {
    for (const char* z : {"{a,b}", "Any", "Nil", "Max"}) {
      HeldSet whole(z), alone(z), rest("{c}");
      HeldSingle single("c");
      const auto selected = static_cast<ZORVaDoAny::ValueSelection>(selection);
      whole.Abstract().Bisect(rest.value, selected);
      alone.Abstract().Bisect(single.value, selected);
      EXPECT_EQ(whole.Now(), selection >= 0 && selection <= 3 ? Set(z) : Set("Nil")) << z << selection;
      EXPECT_EQ(alone.Now(), Set("Nil")) << z << selection;
      whole.Abstract().Bisect(Missing<ZORVaDoObject>(), selected);
      EXPECT_EQ(whole.Now(), Set("Nil")) << z << selection;
      EXPECT_TRUE(rest.Now() == "{c}" && single.Now() == Str("c"));
    }
  }
}

}  // namespace
}  // namespace zor::test
