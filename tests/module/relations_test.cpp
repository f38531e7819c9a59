// The relations that both string classes answer from their states and bounds.
#include <initializer_list>

#include "enum/ZORVadEnumString.h"
#include "tests/support/check.h"

using namespace zor::test;

// clang-format off
static const Truth kOpen{"Any"}, kNone{"Nil"}, kTrue{"true"}, kFalse{"false"};
static const Str a = Text("abc"), b = Text("abd"), kLongest = Times(255, 'z');

static const struct {
  const char* why;
  Str left, right;
  Truth equal, lessOrEqual, less;
} kRelations[] = {
  {"undefined against anything",       kAny,   kMax,     kOpen,  kOpen,  kOpen},
  {"both",                             kAny,   kAny,     kOpen,  kOpen,  kOpen},
  {"undefined before nil",             kNil,   kAny,     kOpen,  kOpen,  kOpen},
  {"nil against anything",             kNil,   kMin,     kNone,  kNone,  kNone},

  {"both the least",                   kMin,   kMin,     kTrue,  kTrue,  kFalse},
  {"both the greatest",                kMax,   kMax,     kTrue,  kTrue,  kFalse},
  {"from end to end",                  kMin,   kMax,     kFalse, kTrue,  kTrue},
  {"and back",                         kMax,   kMin,     kFalse, kFalse, kFalse},
  {"the least is below any text",      kMin,   Text(""), kFalse, kTrue,  kTrue},
  {"and no text below it",             Text(""), kMin,   kFalse, kFalse, kFalse},
  {"the greatest by its state",        kMax,   Text("\xff"), kFalse, kFalse, kFalse},
  {"its text is below it",             kLongest, kMax,   kFalse, kTrue,  kTrue},
  {"equal texts",                      a,      a,        kTrue,  kTrue,  kFalse},
  {"ascending",                        a,      b,        kFalse, kTrue,  kTrue},
  {"descending",                       b,      a,        kFalse, kFalse, kFalse},
};
// clang-format on

template <class Operation>
static void CheckRelation(const char* why, const Str& z, const Str& x, const Truth& outcome, Operation operation) {
  for (const Truth& before : {kOpen, kNone, kTrue, kFalse}) {
    const bool contradicts = outcome.form == "true" || outcome.form == "false";
    const Truth after = !contradicts || before == kOpen || before == outcome ? outcome : kNone;
    Check<2, Str, Str, Truth>({why, {z, x, before}, before == after ? 0 : 1, after}, operation);
  }
}

TEST(Relations, States) {
  for (const auto& [why, left, right, equal, lessOrEqual, less] : kRelations) {
    CheckRelation(why, left, right, equal, ZOR_OPERATION(CalcIsEqual));
    CheckRelation(why, left, right, lessOrEqual, ZOR_OPERATION(CalcIsLessOrEqual));
    CheckRelation(why, left, right, less, ZOR_OPERATION(CalcIsLess));
  }
}

// What becomes of three Booleans, one for each relation; where it is open they stay.
template <class Right>
static std::string Tell(const ZORVaDoString& left, const Right& right, const Truth& held = kTrue) {
  HeldBoolean equal(held), lessOrEqual(held), less(held);
  left.CalcIsEqual(right, equal.value);
  left.CalcIsLessOrEqual(right, lessOrEqual.value);
  left.CalcIsLess(right, less.value);
  return equal.Now().form + " " + lessOrEqual.Now().form + " " + less.Now().form;
}

static ZORVadEnumString Set(std::initializer_list<const char*> texts) {
  ZORVadEnumString set;
  set.SetNilValue();
  for (const char* text : texts) set.InsertExactValue(text);
  return set;
}

TEST(Relations, Bounds) {
  const struct {
    std::initializer_list<const char*> left, right;
    const char* told;
  } rows[] = {
      {{"a", "c"}, {"b", "c"}, "Any Any Any"},     {{"a", "c"}, {"b"}, "false Any Any"},
      {{"a", "c"}, {"d", "e"}, "false true true"}, {{"d", "e"}, {"a", "c"}, "false false false"},
      {{"b", "c"}, {"a", "b"}, "Any Any false"},   {{"a", "b"}, {"b", "c"}, "Any true Any"},
      {{"a", "c"}, {"a"}, "Any Any false"},        {{"b"}, {"b"}, "true true false"},
  };
  for (const auto& [left, right, told] : rows) EXPECT_EQ(Tell(Set(left), Set(right), kOpen), told);
  EXPECT_EQ(Tell(ZORVadSingleString(" "), Set({""}), kOpen), "true true false") << "both the least, of other texts";
}

// Integers, and nothing at all.
TEST(Relations, WrongOperands) {
  const HeldInteger one(Number(1)), any(kAnyNumber);
  for (const Str& known : {a, kMin, kMax}) {
    HeldSingle held(known);
    EXPECT_EQ(Tell(held.value, one.value), "Nil Nil Nil");
    EXPECT_EQ(Tell(held.value, any.value), "Any Any Nil");
    EXPECT_EQ(Tell(held.value, Missing<ZORVaDoScalar>()), "Nil Nil Nil");
    EXPECT_EQ(held.value.CalcUnequalValue(one.value), 0);
    EXPECT_EQ(held.value.CalcUnequalValue(Missing<ZORVaDoAny>()), 0);
    EXPECT_EQ(held.value.CalcInverseUnequalValue(Missing<ZORVaDoAny>()), 0);
    EXPECT_EQ(held.value.CalcUnequalValue(Set({"abc", "b"})), 0);
    EXPECT_EQ(held.Now(), known);
    EXPECT_EQ(held.value.CalcUnequalValue(Set({"abc"})), known == a ? 1 : 0);
    EXPECT_EQ(held.value.CalcUnequalValue(HeldInteger(kNoNumber).value), known == a ? 0 : 1) << "nil before its class";
    EXPECT_EQ(held.Now(), kNil);
  }
  EXPECT_EQ(Tell(HeldSingle(kAny).value, Missing<ZORVaDoScalar>()), "Any Any Nil");
}
