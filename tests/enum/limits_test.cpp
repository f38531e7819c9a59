// Sets of many texts: up to 256 of them and beyond.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

// The first count texts of nothing but b.
Set Runs(int count) {
  Set runs{kExact, {}};
  for (int i = 0; i < count; ++i) runs.texts.push_back(std::string(i, 'b'));
  return runs;
}

TEST(EnumLimits, Concatenation) {
  Set sums{kExact, {}};
  const Set x = Many(16), y = Many(16, "b");
  for (const std::string& head : x.texts)
    for (const std::string& tail : y.texts) sums.texts.push_back(head + tail);
  sums.Sort();
  const Row<0, Set, Set, Set> rows[] = {
      {"256 texts of 256 pairs", {"Any", x, y}, 1, sums},
      {"nothing lost of them", {sums, x, y}, 0, sums},
      {"257 texts", {"{q}", x, Many(17, "b")}, 0, "{q}"},
      {"two of more than 256", {Many(300), "{a}", "{1,99}"}, 1, "{a1,a99}"},
      {"a text that repeats below the limit counts once", {"Any", "{,b}", Runs(255)}, 1, Runs(256)},
      {"beside 256 it is one too many", {"{q}", "{,}", Runs(256)}, 0, "{q}"},
  };
  for (const auto& row : rows) Check(row, ZOR_OPERATION(CalcConcatenation));
}

TEST(EnumLimits, Fold) {
  Set ten{kExact, {}}, many{kExact, {}};  // 320 texts of five letters in either case, ten of them differ
  for (char last = '0'; last <= '9'; ++last) {
    ten.texts.push_back(std::string("abcde") + last);
    for (int cases = 0; cases < 32; ++cases) {
      many.texts.push_back(ten.texts.back());
      for (int i = 0; i < 5; ++i) many.texts.back()[i] ^= (cases >> i & 1) * 0x20;
    }
  }
  many.Sort();
  const Row<0, Set, Set> rows[] = {
      {"256 folds", {"Any", Many(256, "A")}, 1, Many(256)},
      {"one more tells nothing", {"{q}", Many(257)}, 0, "{q}"},
      {"320 texts of ten folds", {"Any", many}, 1, ten},
  };
  for (const auto& row : rows) Check(row, ZOR_OPERATION(CalcLowerValue));
}

TEST(EnumLimits, IntersectionAndUnion) {
  const Row<0, Set, Set> rows[] = {
      {"few texts among many", {"{a,a1,a99,a990,b}", Many(300)}, 1, "{a1,a99}"},
      {"many texts, few of which stay", {Many(300), "{a,a1,a99,a990,b}"}, 1, "{a1,a99}"},
  };
  for (const auto& row : rows) Check(row, ZOR_OPERATION(CalcEqualValue));
  HeldSet large(Many(200));
  large.value.Unite(HeldSet(Many(200, "b")).value);
  EXPECT_EQ(large.value.Count(), 400);
}

// More texts than a set may list open it, but for texts of a length that are few enough.
TEST(EnumLimits, Length) {
  const auto expect = [](const Set& z, const char* length, const Set& after) {
    HeldSet held(z);
    EXPECT_EQ(held.value.CalcInverseLength(Form<ZORVadIntervalInteger, ZORVaDoInteger>::Held({length}).value), 1);
    EXPECT_EQ(held.Now(), after);
  };
  expect(Many(256), "1..9", Many(256));
  expect(Many(257), "1..9", "Any");
  expect(Many(300), "2", Many(10));
}

// The 256th text still goes in, one more opens the value, also one that is listed; larger sets take more.
TEST(EnumLimits, InsertExactValue) {
  for (const char* text : {"b", "a7"}) {
    HeldSet full(Many(256)), almost(Many(255)), larger(Many(257));
    almost.value.InsertExactValue("b");
    full.value.InsertExactValue(text);
    larger.value.InsertExactValue(text);
    EXPECT_TRUE(almost.Now().tag == kExact && almost.Now().texts.size() == 256);
    EXPECT_EQ(full.Now(), Set("Any"));
    EXPECT_EQ(larger.Now().texts.size(), std::string("b") == text ? 258u : 257u);
    full.value.InsertExactValue("b");
    EXPECT_EQ(full.Now(), Set("Any"));
  }
}

}  // namespace
}  // namespace zor::test
