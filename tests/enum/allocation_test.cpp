// Operations that leave a set as it was allocate nothing that stays, most of them nothing at all.
#include "tests/support/costs.h"

namespace zor::test {
namespace {

TEST(EnumCost, UnchangedValues) {
  const Set open, full = "Max", many = Many(256), some = Many(100);
  for (const Set& z : {Set("{a,b}"), many}) {
    for (const char* name : {"CalcEqualValue", "CalcLessOrEqualValue", "CalcNotLessValue", "Intersect"})
      ExpectCost(name, {z, z}, 0, 0);
    ExpectCost("CalcEqualValue", {z, open}, 0, 0);
    ExpectCost("IsIntersected", {z, z}, 0, 1);
  }
  ExpectCost("Unite", {many, some}, 1, 0);
  ExpectCost("CalcEqualValue", {many, some}, 0, 1);    // texts that go
  ExpectCost("CalcEqualValue", {open, many}, 257, 1);  // its texts and its places
  for (const Set& z : {Set("{a,b}"), Set(""), many, full, open}) {
    HeldSet held(z);
    const ZORString text("a17");
    const int before = sAllocations;
    const unsigned long told = held.value.GetCardinality() + held.value.IsFull() + held.value.IsEmpty() +
                               static_cast<unsigned>(held.value.Contains(text));
    held.value.Intersect(held.value);
    const int cuts = held.value.CutLower("") + held.value.CutUpper("z");
    EXPECT_EQ(sAllocations, before) << z << told << cuts;
  }
}

// What is built and found to be there already is freed again.
TEST(EnumCost, WhatIsThereAlready) {
  ExpectCost("CalcConcatenation", {Set("{ac,ad,bc,bd}"), Set("{a,b}"), Set("{c,d}")}, 1000, 0);
  ExpectCost("CalcLowerValue", {Set("{a,b}"), Set("{A,B,b}")}, 1000, 0);
}

}  // namespace
}  // namespace zor::test
