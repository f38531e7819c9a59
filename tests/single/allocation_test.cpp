// What calls cost: those that leave known values as they are allocate nothing, but for a long text that has to be
// worked out to be compared.
#include "tests/support/allocations.h"
#include "tests/support/check.h"

using namespace zor::test;

template <class Operation, class... Operands>
static void Expect(int atMost, int answer, Operation operation, const Operands&... operands) {
  std::tuple<typename Operands::Held...> held(operands...);
  const int before = sAllocations;
  const int answered = std::apply([&](auto&... v) { return operation(v.Typed()...); }, held);
  const int made = sAllocations - before;
  EXPECT_EQ(answered, answer);
  EXPECT_LE(made, atMost);
}

#define EXPECT_COST(Name, atMost, answer, ...)                \
  {                                                           \
    SCOPED_TRACE(#Name);                                      \
    Expect(atMost, answer, ZOR_OPERATION(Name), __VA_ARGS__); \
  }

TEST(SingleCost, ByLength) {
  for (const int length : {10, 120}) {  // inside a value, outside it
    const int perText = length == 10 ? 0 : 1;
    const Str a = Times(length, 'a'), b = Times(length, 'b'), sum = Times(length, 'a', b.text);
    // clang-format off
    EXPECT_COST(CalcEqualValue,                 0,       0, a, a)
    EXPECT_COST(IsIntersected,                  0,       1, a, a)
    EXPECT_COST(CalcLessValue,                  0,       0, a, b)
    EXPECT_COST(CalcInverseNotLessValue,        0,       0, a, a)
    EXPECT_COST(CalcMaxValue,                   0,       0, b, a, b)
    EXPECT_COST(CalcFirstInverseMinValue,       0,       0, a, b, a)
    EXPECT_COST(CalcInverseLength,              0,       0, a, Number(length))
    EXPECT_COST(CalcConcatenation,              0,       0, sum, a, b)
    EXPECT_COST(CalcConcatenation,              perText, 1, kAny, a, b)
    EXPECT_COST(CalcFirstInverseConcatenation,  perText, 0, sum, a, b)
    EXPECT_COST(CalcSecondInverseConcatenation, perText, 0, sum, a, b)
    EXPECT_COST(CalcSubString,                  perText, 0, a, sum, Number(0), Number(length - 1))
    EXPECT_COST(CalcLowerValue,                 perText, 0, a, Times(length, 'A'))
    // clang-format on
  }
}
