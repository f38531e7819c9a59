// What calls cost: one that leaves the target as it was allocates nothing and keeps its very texts.
#include "tests/enum/sets.h"
#include "tests/support/allocations.h"

namespace zor::test {
namespace {

template <class Operation, class... Operands>
void Expect(const char* why, int atMost, int answer, Operation operation, const Operands&... operands) {
  std::tuple<typename Operands::Held...> held(operands...);
  const auto objects = std::get<0>(held).Objects();
  const auto count = [&](auto&... v) {
    const int before = sAllocations;
    EXPECT_EQ(operation(v.Typed()...), answer) << why;
    return sAllocations - before;
  };
  EXPECT_LE(std::apply(count, held), atMost) << why;
  EXPECT_TRUE(answer != 0 || std::get<0>(held).Objects() == objects) << why;
}

TEST(EnumCost, UnchangedValues) {
  const Set few = "{a,b}", many = Many(256), some = Many(100), full = "Max", open = "Any";
  for (const Set& z : {few, many, full, open}) {
    Expect(
        "states", 0, 0, [](auto& v) { return v.IsEmpty() != 0 && v.IsFull() != 0 && v.GetCardinality() == 1; }, z);
    Expect(
        "a listed text", 0, 0, [](auto& v) { return v.Contains("a17") < -1; }, z);
  }
  for (const Set& z : {few, many}) {
    Expect("intersection", 0, 0, ZOR_OPERATION(CalcEqualValue), z, z);
    Expect(
        "with itself", 0, 0, [](auto& v) { return v.Intersect(v); }, z);
    Expect("with an open value", 0, 0, ZOR_OPERATION(CalcEqualValue), z, open);
    Expect("a common text", 0, 1, ZOR_OPERATION(IsIntersected), z, z);
    Expect("order", 0, 0, ZOR_OPERATION(CalcLessOrEqualValue), z, z);
    Expect("order to the bound", 0, 0, ZOR_OPERATION(CalcNotLessValue), z, z);
    Expect(
        "cuts", 0, 0, [](auto& v) { return v.CutLower("") == v.CutUpper("z") ? 0 : 1; }, z);
  }
  Expect("texts that go", 0, 1, ZOR_OPERATION(CalcEqualValue), many, some);
  Expect(
      "a union of texts that are there", 1, 0, [](auto& z, auto& x) { return z.Unite(x), 0; }, many, some);
  Expect("a copy: its texts and its places", 257, 1, ZOR_OPERATION(Copy), open, many);
}

// What is built and found to be there already is freed.
TEST(EnumCost, SameObjects) {
  Expect("sums", 1000, 0, ZOR_OPERATION(CalcConcatenation), Set("{ac,ad,bc,bd}"), Set("{a,b}"), Set("{c,d}"));
  Expect("folds", 1000, 0, ZOR_OPERATION(CalcLowerValue), Set("{a,b}"), Set("{A,B,C}"));
}

}  // namespace
}  // namespace zor::test
