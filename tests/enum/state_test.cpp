// Construction and copies of sets of texts, and what tells them nothing.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

TEST(EnumState, Construction) {
  const ZORVadEnumString fresh;
  EXPECT_EQ(Of(fresh), Set("Any"));
  EXPECT_TRUE(fresh.GetCardinality() == 256 && fresh.Contains("") == 0);
  EXPECT_EQ(Of(ZORVadEnumString(ZORString("ab"))), Set("{ab}"));
  EXPECT_EQ(Of(ZORVadEnumString(static_cast<const void*>("ab"))), Set("{ab}"));
  EXPECT_EQ(Of(ZORVadEnumString(HeldSet("{a,b,Max}").value)), Set("{a,b,Max}"));
  EXPECT_EQ(Of(ZORVadEnumString(HeldSet("Any{a,a}").value)), Set("Any{a,a}"));
  EXPECT_EQ(Of(ZORVadEnumString(HeldSet("{a,a}").value)), Set("{a}")) << "a copy lists each text once";
  for (const auto& [single, set] : std::initializer_list<std::pair<Str, Set>>{
           {Text("abc"), "{abc}"}, {kMin, "{ }"}, {kMax, "Max"}, {{kAnyTag, "a"}, "Any"}, {{kNilTag, "a"}, "Nil"}}) {
    EXPECT_EQ(Of(ZORVadEnumString(HeldSingle(single).value)), set);
  }
}

// Assigning a value to itself changes nothing, in any form.
TEST(EnumState, SelfAssignment) {
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
}

// What one value does never shows in another.
TEST(EnumState, CopiesShareNothing) {
  HeldSet original("{a,b,c}"), assigned("{x}");
  ZORVadEnumString copy(original.value);
  assigned.value = copy;
  copy.GetValue(1) = "bb";
  EXPECT_EQ(Of(copy), Set("{a,bb,c}"));
  copy.CutUpper("a");
  original.value.SetUpperBound("aa");
  EXPECT_EQ(original.Now(), Set("{a,aa}"));
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

// The three selections leave the value as it was, any other, like a missing or a single operand, makes it Nil.
TEST(EnumState, Bisect) {
  for (const int selection : {-1, 0, 1, 2, 3, 4}) {
    for (const char* z : {"{a,b}", "Any", "Nil", "Max"}) {
      HeldSet whole(z), alone(z), rest("{c}");
      HeldSingle single(Text("c"));
      const auto selected = static_cast<ZORVaDoAny::ValueSelection>(selection);
      whole.Abstract().Bisect(rest.value, selected);
      alone.Abstract().Bisect(single.value, selected);
      EXPECT_EQ(whole.Now(), selection >= 0 && selection <= 3 ? Set(z) : Set("Nil")) << z << selection;
      EXPECT_EQ(alone.Now(), Set("Nil")) << z << selection;
      whole.Abstract().Bisect(Missing<ZORVaDoObject>(), selected);
      EXPECT_EQ(whole.Now(), Set("Nil")) << z << selection;
      EXPECT_TRUE(rest.Now() == "{c}" && single.Now() == Text("c"));
    }
  }
}

// Neither form of these tells anything, whatever the operands.
TEST(EnumState, SubStringsAndFormsTellNothing) {
  for (const char* known : {"{ab}", "Nil", "Any"}) {
    HeldSet z(known), x("{a,b}");
    HeldInteger start(Number(0)), end(kAnyNumber);
    const auto slices = [&](auto& value, auto& operand) {
      EXPECT_EQ(value.CalcSubString(operand, start.value, end.value), 0);
      EXPECT_EQ(value.CalcFirstInverseSubString(operand, start.value, end.value), 0);
      EXPECT_EQ(value.CalcSecondInverseSubString(operand, start.value, end.value), 0);
      EXPECT_EQ(value.CalcThirdInverseSubString(operand, start.value, end.value), 0);
    };
    slices(z.value, x.value);
    for (ZORVaDoString* operand : {&x.Abstract(), &Missing<ZORVaDoString>()}) {
      slices(z.Abstract(), *operand);
      EXPECT_EQ(z.Abstract().CalcStringRepresentation(*operand), 0);
      EXPECT_EQ(z.Abstract().CalcInverseStringRepresentation(*operand), 0);
    }
    EXPECT_TRUE(z.Now() == known && x.Now() == "{a,b}" && start.Now() == Number(0) && end.Now() == kAnyNumber);
  }
}

}  // namespace
}  // namespace zor::test
