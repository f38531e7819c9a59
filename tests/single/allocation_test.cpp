// Operations that leave known values as they are allocate nothing, but for a long text that has to be worked out to be
// compared.
#include "tests/support/costs.h"

using namespace zor::test;

TEST(SingleCost, ByLength) {
  for (const int length : {10, 120}) {  // inside a value, outside it
    const int perText = length == 10 ? 0 : 1;
    const Str a = Times(length, 'a'), b = Times(length, 'b'), sum = Times(length, 'a', b.text);
    ExpectCost("CalcEqualValue", {a, a}, 0, 0);
    ExpectCost("IsIntersected", {a, a}, 0, 1);
    ExpectCost("CalcLessValue", {a, b}, 0, 0);
    ExpectCost("CalcInverseNotLessValue", {a, a}, 0, 0);
    ExpectCost("CalcMaxValue", {b, a, b}, 0, 0);
    ExpectCost("CalcFirstInverseMinValue", {a, b, a}, 0, 0);
    ExpectCost("CalcInverseLength", {a, Int(length)}, 0, 0);
    ExpectCost("CalcConcatenation", {sum, a, b}, 0, 0);
    ExpectCost("CalcConcatenation", {kAny, a, b}, perText, 1);
    ExpectCost("CalcFirstInverseConcatenation", {sum, a, b}, perText, 0);
    ExpectCost("CalcSecondInverseConcatenation", {sum, a, b}, perText, 0);
    ExpectCost("CalcSubString", {a, sum, Int(0), Int(length - 1)}, perText, 0);
    ExpectCost("CalcLowerValue", {a, Times(length, 'A')}, perText, 0);
  }
}
