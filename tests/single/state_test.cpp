// Construction, copies, states and single texts of single strings.
#include <functional>

#include "enum/ZORVadEnumString.h"
#include "tests/support/values.h"

using namespace zor::test;

// clang-format off
static const Str kStale{kAnyTag, "old"}, kStaleNil{kNilTag, "old"}, ab = Text("ab"), x = Text("x");

#define DO(expression) [](ZORVadSingleString& v) -> int { return expression; }
#define RUN(expression) DO((expression, 0))
#define FROM(source) HeldSingle(source).value
static const struct {
  const char* why;
  Str before;
  std::function<int(ZORVadSingleString&)> act;
  int answer;
  Str after;
  int again = 0;
} kChanges[] = {
  {"nil has no text",                   kStale,          DO(v.Nil()),                     1, kNil},
  {"a nil value keeps its text",        kStaleNil,       DO(v.Nil()),                     0, kStaleNil},
  {"setting nil drops it",              kStaleNil,       RUN(v.SetNilValue()),            0, kNil},
  {"undefined has the longest text",    kNil,            DO(v.Any()),                     1, kAny},
  {"an undefined one keeps its text",   kStale,          DO(v.Any()),                     0, kStale},
  {"setting undefined replaces it",     kStale,          RUN(v.SetUndefinedValue()),      0, kAny},
  {"min through the table",             kAny,            DO(v.CalcEmptyValue()),          1, kMin},
  {"max through the table",             kNil,            DO(v.CalcFullValue()),           1, kMax},
  {"the text of max is not max",        Times(255, 'z'), DO(v.CalcMaxValue()),            1, kMax},
  {"bisecting leaves nothing",          kAny, RUN(v.Bisect(Missing<ZORVaDoObject>(), ZORVaDoAny::ValueSelection(9))), 0, kNil},

  {"exact, whatever it was",            kMax,            RUN(v.SetExactValue("x")),       0, x},
  {"a bound is the text",               kNil,            RUN(v.SetLowerBound("x")),       0, x},
  {"so is the other, of any length",    kAny,            RUN(v.SetUpperBound(Packed(std::string(300, 'x')))), 0, Times(300, 'x')},
  {"inserting into undefined",          kAny,            RUN(v.InsertExactValue("x")),    0, kAny},
  {"inserting into nil",                kNil,            RUN(v.InsertExactValue("x")),    0, x},
  {"inserting the text of max",         kMax,            RUN(v.InsertExactValue(ZORVaDoString::ZorVaDoStringMax)), 0, kMax},
  {"two texts are too many",            kMin,            RUN(v.InsertExactValue("x")),    0, kAny},
  {"removing the text",                 x,               DO(v.RemoveExactValue("x")),     1, kNil},
  {"removing another",                  x,               DO(v.RemoveExactValue("y")),     0, x},
  {"removing the stale text",           kStale,          DO(v.RemoveExactValue("old")),   0, kStale},
  {"removing the text of max",          kMax,            DO(v.RemoveExactValue(ZORVaDoString::ZorVaDoStringMax)), 1, kNil},

  {"copied from nil",                   ab,              DO(v.Copy(FROM(kNil))),          0, {kNilTag, "ab"}},
  {"copied from a text",                kMax,            DO(v.Copy(ZORString("x"))),      1, x, 1},
  {"characters make it exact",          kNil,            RUN(v = "x"),                    0, x},
  {"its own copy",                      ab,              DO((v.operator=(v), v.Copy(v))),          1, ab, 1},
  {"a nil value stays as it was",       kStaleNil,       RUN(v.Assign(ZORVadEnumString("ab"))), 0, kStaleNil},
};

static const struct {
  Str value;
  int isNil, isAny, isEmpty, isFull;
  unsigned long cardinality;
} kQuestions[] = {
  {kNil,            1, 0, 0, 0, 0},    {kAny,           0, 1, 0, 0, 255},
  {kMin,            0, 0, 1, 0, 1},    {kMax,           0, 0, 0, 1, 1},
  {Text(""),        0, 0, 0, 0, 1},    {{kNilTag, " "}, 1, 0, 0, 0, 0},
  {Times(255, 'z'), 0, 0, 0, 0, 1},    {Text("  "),     0, 0, 0, 0, 1},
};
// clang-format on

TEST(SingleState, Changes) {
  for (const auto& row : kChanges) {
    HeldSingle held(row.before);
    for (const int answer : {row.answer, row.again}) {
      EXPECT_EQ(row.act(held.value), answer) << row.why;
      EXPECT_EQ(held.Now(), row.after) << row.why;
    }
  }
}

TEST(SingleState, Constructors) {
  const auto now = [](const ZORVadSingleString& v) { return Str{v.GetState(), Plain(v.GetLowerBound())}; };
  EXPECT_EQ(now(ZORVadSingleString()), kAny);
  EXPECT_EQ(now(ZORVadSingleString(ZORString("ab"))), ab);
  EXPECT_EQ(now(ZORVadSingleString("ab")), ab);
  EXPECT_EQ(now(ZORVadSingleString(FROM(kMax))), kMax);
  const HeldSingle stale(kStale);
  EXPECT_EQ(now(ZORVadSingleString(stale.value)), (Str{kAnyTag, ""}));
  EXPECT_EQ(now(ZORVadSingleString(ZorStreamableInit)).text, "");
}

TEST(SingleState, Questions) {
  for (const auto& row : kQuestions) {
    HeldSingle held(row.value);
    const ZORVadSingleString& v = held.value;
    EXPECT_TRUE(v.IsNil() == row.isNil && v.CheckNil() == row.isNil && v.IsUndefined() == row.isAny) << row.value;
    EXPECT_TRUE(v.CheckAny() == row.isAny && v.IsEmpty() == row.isEmpty && v.IsFull() == row.isFull) << row.value;
    EXPECT_EQ(v.GetCardinality(), row.cardinality) << row.value;
    const ZORString &next = v.GetNextExactValue("a"), &previous = v.GetPrevExactValue("a");
    EXPECT_TRUE(next == v.GetLowerBound() && previous == next && v.GetUpperBound() == next) << row.value;
  }
}
