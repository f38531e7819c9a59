// Every operation on every combination of values, beside the model.
#include <iterator>
#include <tuple>

#include "enum/ZORVadEnumString.h"
#include "tests/single/model.h"
#include "tests/support/beside.h"
#include "tests/support/check.h"

using namespace zor::test;

// clang-format off
#define PAIR(Name, target, ofEntry) ZOR_BESIDE(Name, 2, target, (*v[1]), (v[0], v[1]), ofEntry),
#define ZOR_Algebra(Name, ...)  PAIR(Name, 0, (model::Name(v[0], v[1]), 0))
#define ZOR_Test(Name, ...)     PAIR(Name, 0, (model::Name(v[0], v[1])))
#define ZOR_Pair(Name, ...)     PAIR(Name, (zor::TargetOf<__VA_ARGS__>()), (model::Name(v[0], v[1])))
#define ZOR_Equality ZOR_Pair
#define ZOR_Form ZOR_Pair
#define ZOR_Triple(Name, ...) \
  ZOR_BESIDE(Name, 3, (zor::TargetOf<__VA_ARGS__>()), (*v[1], *v[2]), (v[0], v[1], v[2]), (model::Name(v[0], v[1], v[2]))),
#define ZOR_Alone(...)
#define ZOR_Truth(...)
#define ZOR_Length(...)
#define ZOR_Slice(...)  // below, with positions
#define ROW(Shape, ...) ZOR_##Shape(__VA_ARGS__)

static const Beside<Str> kBeside[] = {ZOR_STRING_OPERATIONS(ROW)};

// The last ones are for operations on two strings alone.
static const Str kValues[] = {
  kNil, {kNilTag, "ab"}, kAny, {kAnyTag, "a"}, kMax, kMin, Text(""), Text("a"), Text("ab"), Text("b"), Text("aba"),
  Times(255, 'z'), Times(254, 'z'), Times(200, 'a'), Times(55, 'a'), Times(56, 'a'),
  Text("A"), Text("aB"), Text("  "), Text("a!"), Text("\"a\""), Text("Max"), Text("\xff!"), Times(255, 'A'),
  Times(256, 'z'), Times(254, 'z', "y"), Times(254, 'a', "z"), Times(256, 'a', "z"), {kNilTag, "Min"},
};
static constexpr std::size_t kOfThree = 16;
static const Str kSliced[] = {kNil, kAny, {kAnyTag, "b"}, kMax, kMin, Text(""), Text("a"), Text("bc"), Text("b"), Text("abcbc"),
                       Text("bcb"), Times(255, 'z'), Times(300, 'c')};
static const Int kPositions[] = {kNoNumber, kAnyNumber, Number(INT_MIN), Number(INT_MIN + 1), Number(-2), Number(-1), Number(0),
                          Number(1), Number(2), Number(3), Number(254), Number(255), Number(299), Number(INT_MAX - 1),
                          Number(INT_MAX)};
// clang-format on
TEST(SingleModel, EveryCombination) {
  for (const auto& operation : kBeside) ASSERT_NO_FATAL_FAILURE(CompareAll(operation, kValues, kOfThree));
}

TEST(SingleModel, WrongOperands) {
  ZORVadEnumString set(ZORString("b"));
  for (const Str& z : {Text("ab"), kAny, kMax}) {
    for (const auto& operation : kBeside) {
      if (operation.Is("CalcStringRepresentation", "CalcInverseStringRepresentation")) continue;
      CheckWrongOperands(operation, z, Text("b"), nullptr);
      CheckWrongOperands(operation, z, Text("b"), &set);
    }
    CheckIntegers(z);
  }
  EXPECT_TRUE(set.GetState() == kExact && set.Count() == 1);
}

// Two calls; both positions may be one object.
template <class Operation, class Model>
static void CompareSlice(Operation operation, Model slow, Str z, Str x, Int start, Int end, bool shared, bool typed) {
  HeldSingle heldZ(z), heldX(x);
  HeldInteger heldStart(start), heldEnd(end);
  HeldInteger& last = shared ? heldStart : heldEnd;
  for (int call = 1; call <= 2; ++call) {
    const Int before = start;
    const int expected = slow(z, x, start, end);
    if (shared) start = end = start == before ? end : start;
    const int answer = typed ? operation(heldZ.value, heldX.value, heldStart.value, last.value)
                             : operation(heldZ.Abstract(), heldX.Abstract(), heldStart.Abstract(), last.Abstract());
    ASSERT_EQ(std::tuple(answer, heldZ.Now(), heldX.Now(), heldStart.Now(), last.Now()),
              std::tuple(expected, z, x, start, end));
  }
}

template <class Operation, class Model>
static void CompareSlices(Operation operation, Model slow) {
  constexpr std::size_t n = std::size(kSliced), m = std::size(kPositions);
  for (std::size_t i = 0; i < n * n * m * m; ++i) {
    const Str &z = kSliced[i % n], &x = kSliced[i / n % n];
    const Int &start = kPositions[i / n / n % m], &end = kPositions[i / n / n / m];
    for (const int form : {0, 1, 2, 3}) {
      const bool shared = form >= 2;
      if (!shared || start == end) CompareSlice(operation, slow, z, x, start, end, shared, form % 2 == 0);
      ASSERT_FALSE(testing::Test::HasFatalFailure()) << z << ", " << x << ", " << start << ", " << end << ' ' << form;
    }
  }
}

#define COMPARE_SLICES(Name) CompareSlices(ZOR_OPERATION(Name), [](auto&... v) { return model::Name(v...); })
TEST(SingleModel, SubString) { COMPARE_SLICES(CalcSubString); }
TEST(SingleModel, FirstInverseSubString) { COMPARE_SLICES(CalcFirstInverseSubString); }
TEST(SingleModel, SecondInverseSubString) { COMPARE_SLICES(CalcSecondInverseSubString); }
TEST(SingleModel, ThirdInverseSubString) { COMPARE_SLICES(CalcThirdInverseSubString); }
