// Intersection, union and equality of single strings.
#include "enum/ZORVadEnumString.h"
#include "tests/support/check.h"

using namespace zor::test;

// clang-format off
static const Str a = Text("abc"), b = Text("abd");
static const Str kStates[] = {kAny, kNil, kMin, kMax, a, b};

// What becomes of *this, a row for each of its states, a column for each of the other's.
static const Str kIntersections[][6] = {
  {kAny, kNil, kMin, kMax, a,    b},
  {kNil, kNil, kNil, kNil, kNil, kNil},
  {kMin, kNil, kMin, kMax, kNil, kNil},
  {kMax, kNil, kMin, kMax, kNil, kNil},
  {a,    kNil, kMin, kMax, a,    kNil},
  {b,    kNil, kMin, kMax, kNil, b},
};
static const Str kUnions[][6] = {
  {kAny, kAny, kAny, kAny, kAny, kAny},
  {kAny, kNil, kAny, kAny, a,    b},
  {kAny, kMin, kMin, kAny, kAny, kAny},
  {kAny, kMax, kAny, kMax, kAny, kAny},
  {kAny, a,    kAny, kAny, a,    kAny},
  {kAny, b,    kAny, kAny, kAny, b},
};
// clang-format on

TEST(SingleAlgebra, EveryPairOfStates) {
  const auto unite = [](auto& z, auto& x) { return z.Unite(x), 0; };
  const auto intersect = [](auto& z, auto& x) { return z.Intersect(x), 0; };
  for (int i = 0; i < 6; ++i) {
    for (int j = 0; j < 6; ++j) {
      const Str &z = kStates[i], &x = kStates[j], &both = kIntersections[i][j];
      const int changed = both == z ? 0 : 1, meet = z != kNil && x != kNil && (i == j || i == 0 || j == 0) ? 1 : 0;
      Check<0, Str, Str>({"intersection", {z, x}, changed, both}, ZOR_OPERATION(CalcEqualValue));
      Check<1, Str, Str>({"inverse", {x, z}, changed, both}, ZOR_OPERATION(CalcInverseEqualValue));
      Check<0, Str, Str>({"without answer", {z, x}, 0, both}, intersect);
      Check<0, Str, Str>({"union", {z, x}, 0, kUnions[i][j]}, unite);
      Check<0, Str, Str>({"whether they meet", {z, x}, meet, z, meet}, ZOR_OPERATION(IsIntersected));
    }
  }
}

// Where an operand is no single string: a set, an integer, nothing.
TEST(SingleAlgebra, WrongOperands) {
  ZORVadEnumString set(ZORString("abc"));
  HeldInteger integer(Number(1));
  for (ZORVaDoAny* operand :
       {static_cast<ZORVaDoAny*>(&set), static_cast<ZORVaDoAny*>(&integer.value), &Missing<ZORVaDoAny>()}) {
    for (const Str& before : {a, kAny, kMax}) {
      HeldSingle kept(before), intersected(before), united(before);
      EXPECT_EQ(kept.value.CalcEqualValue(*operand), 0);
      EXPECT_EQ(kept.value.CalcInverseEqualValue(*operand), 0);
      EXPECT_EQ(kept.value.IsIntersected(*operand), before == kAny ? 1 : 0) << before;
      EXPECT_EQ(kept.Now(), before);
      intersected.value.Intersect(*operand);
      united.value.Unite(*operand);
      EXPECT_TRUE(intersected.Now() == kNil && united.Now() == kNil) << before;
    }
  }
}
