// Every operation on every combination of values, beside the model.
#include <iterator>
#include <tuple>

#include "enum/ZORVadEnumString.h"
#include "tests/single/model.h"
#include "tests/support/check.h"

using namespace zor::test;

struct Operation {
  const char* name;
  int operands;
  int target;
  bool guarded;  // answers 0, nothing changed, when an operand is missing or no single string
  int (*typed)(ZORVadSingleString* const* v);
  int (*entry)(ZORVaDoString* const* v);
  int (*model)(Str* v);
};

// clang-format off
#define ROW(Name, operands, target, guarded, args, modelArgs) \
  {#Name, operands, target, guarded, [](ZORVadSingleString* const* v) -> int { return ANSWER(v[0]->Name args); }, \
   [](ZORVaDoString* const* v) -> int { return ANSWER(v[0]->Name args); }, [](Str* v) { return model::Name modelArgs; }}
#define TWO(Name, target)        ROW(Name, 2, target, true,  (*v[1]),        (v[0], v[1]))
#define TWO_OPEN(Name, target)   ROW(Name, 2, target, false, (*v[1]),        (v[0], v[1]))
#define THREE(Name, target)      ROW(Name, 3, target, true,  (*v[1], *v[2]), (v[0], v[1], v[2]))

static const Operation kOperations[] = {
#define ANSWER(call) call
  THREE(CalcConcatenation, 0), THREE(CalcFirstInverseConcatenation, 1), THREE(CalcSecondInverseConcatenation, 2),
  THREE(CalcMinValue, 0), THREE(CalcFirstInverseMinValue, 1), THREE(CalcMaxValue, 0), THREE(CalcFirstInverseMaxValue, 1),
  TWO(CalcNextValue, 0), TWO(CalcInverseNextValue, 1), TWO(CalcEqualValue, 0), TWO(CalcInverseEqualValue, 1),
  TWO(CalcLessValue, 0), TWO(CalcInverseLessValue, 1), TWO(CalcLessOrEqualValue, 0), TWO(CalcInverseLessOrEqualValue, 1),
  TWO(CalcNotLessValue, 0), TWO(CalcInverseNotLessValue, 1),
  TWO(CalcNotLessAndUnequalValue, 0), TWO(CalcInverseNotLessAndUnequalValue, 1),
  TWO(CalcLowerValue, 0), TWO(CalcInverseLowerValue, 1), TWO(CalcUpperValue, 0), TWO(CalcInverseUpperValue, 1),
  TWO_OPEN(CalcUnequalValue, 0), TWO_OPEN(CalcInverseUnequalValue, 1), TWO_OPEN(IsIntersected, 0),
  TWO_OPEN(CalcStringRepresentation, 0), TWO_OPEN(CalcInverseStringRepresentation, 1),
#undef ANSWER
#define ANSWER(call) (static_cast<void>(call), 0)
  TWO_OPEN(Assign, 0), TWO_OPEN(Intersect, 0), TWO_OPEN(Unite, 0),
};

// The last ones are for operations on two strings alone.
static const Str kValues[] = {
  kNil, {kNilTag, "ab"}, kAny, {kAnyTag, "a"}, kMax, kMin, Text(""), Text("a"), Text("ab"), Text("b"), Text("aba"),
  Times(255, 'z'), Times(254, 'z'), Times(200, 'a'), Times(55, 'a'), Times(56, 'a'),
  Text("A"), Text("aB"), Text("  "), Text("a!"), Text("\"a\""), Text("Max"), Text("\xff!"), Times(255, 'A'),
  Times(256, 'z'), Times(254, 'z', "y"), Times(254, 'a', "z"), Times(256, 'a', "z"),
};
static constexpr std::size_t kOfThree = 16;
static const Str kSliced[] = {kNil, kAny, {kAnyTag, "b"}, kMax, kMin, Text(""), Text("a"), Text("bc"), Text("b"), Text("abcbc"),
                       Text("bcb"), Times(255, 'z'), Times(300, 'c')};
static const Int kPositions[] = {kNoNumber, kAnyNumber, Number(INT_MIN), Number(INT_MIN + 1), Number(-2), Number(-1), Number(0),
                          Number(1), Number(2), Number(3), Number(254), Number(255), Number(299), Number(INT_MAX - 1),
                          Number(INT_MAX)};
// clang-format on
static constexpr int kPatterns[][3] = {
    {0, 1, 2}, {0, 0, 2}, {0, 1, 0}, {0, 1, 1}, {0, 0, 0}};  // who is the same object

// Two calls in one form; pattern says which operands are one object.
template <class Class, class Form>
static void Compare(const Operation& operation, const Str* v, const int* pattern, Form form) {
  HeldSingle held[] = {HeldSingle(v[0]), HeldSingle(v[1]), HeldSingle(v[2])};
  Class* operands[3];
  for (int i = 0; i < 3; ++i) operands[i] = &held[pattern[i]].value;
  Str expected[] = {v[0], v[1], v[2]};
  for (int call = 1; call <= 2; ++call) {
    Str copies[3];
    for (int i = 0; i < 3; ++i) copies[i] = expected[pattern[i]];
    const int answer = operation.model(copies);
    expected[pattern[operation.target]] = copies[operation.target];
    ASSERT_EQ((operation.*form)(operands), answer) << "call " << call;
    for (int i = 0; i < 3; ++i) ASSERT_EQ(held[i].Now(), expected[i]) << "operand " << i << " after call " << call;
  }
}

TEST(SingleModel, EveryCombination) {
  for (const Operation& operation : kOperations) {
    const std::size_t n = operation.operands == 3 ? kOfThree : std::size(kValues);
    for (std::size_t i = 0; i < (operation.operands == 3 ? n * n * n : n * n); ++i) {
      const Str v[] = {kValues[i % n], kValues[i / n % n], kValues[i / n / n]};
      for (const auto& pattern : kPatterns) {
        if (operation.operands == 2 && pattern[2] != 2) continue;
        Compare<ZORVadSingleString>(operation, v, pattern, &Operation::typed);
        Compare<ZORVaDoString>(operation, v, pattern, &Operation::entry);
        ASSERT_FALSE(HasFatalFailure()) << v[0] << '.' << operation.name << ' ' << v[1] << ' ' << v[2] << ", objects "
                                        << pattern[0] << pattern[1] << pattern[2];
      }
    }
  }
}

// An operand is missing, or is a set of strings.
TEST(SingleModel, Guards) {
  for (const Operation& operation : kOperations) {
    for (int i = 2; operation.guarded && i < 2 * operation.operands; ++i) {
      HeldSingle held[] = {HeldSingle(Text("ab")), HeldSingle(Text("b")), HeldSingle(Text("b"))};
      ZORVadEnumString set(ZORString("b"));
      ZORVaDoString* operands[] = {&held[0].value, &held[1].value, &held[2].value};
      operands[i / 2] = i % 2 == 0 ? nullptr : &set;
      EXPECT_EQ(operation.entry(operands), 0) << operation.name << ' ' << i;
      EXPECT_TRUE(held[0].Now() == Text("ab") && held[1].Now() == Text("b") && held[2].Now() == Text("b") &&
                  set.GetState() == kExact && set.Count() == 1)
          << operation.name << ' ' << i;
    }
  }
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
