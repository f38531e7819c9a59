// Construction, copies, states and lengths of single strings, and examples of their operations.
#include <gtest/gtest.h>

#include "tests/support/examples.h"

using namespace zor::test;

// clang-format off
static const Example kExamples[] = {  // why, operation, operands, answer, target afterwards
  {"an extreme replaces a text",             "CalcEqualValue", {"abc", "Min"}, 1, "Min"},
  {"no text an extreme",                     "CalcEqualValue", {"Max", "abc"}, 1, "Nil"},
  {"codes are unsigned",                     "CalcNotLessValue", {"z", "\xff"}, 1, "Nil"},
  {"nothing lies above max",                 "CalcLessOrEqualValue", {"Max", "\xff"}, 1, "Nil"},
  {"any operand overwrites nil",             "CalcMaxValue", {"Nil", "Any", "abc"}, 1, "Any"},
  {"two max overwrite a text",               "CalcMinValue", {"abc", "Max", "Max"}, 1, "Max"},
  {"at the limit z goes, the one before steps", "CalcNextValue", {"Any", "a*253zz"}, 1, "a*252b"},
  {"any operand overwrites a known target",  "CalcConcatenation", {"ab", "a", "Any"}, 1, "Any"},
  {"255 characters are still a text",        "CalcConcatenation", {"Any", "z*200", "z*55"}, 1, "z*255"},
  {"256 characters are max",                 "CalcConcatenation", {"abc", "a*200", "b*56"}, 1, "Max"},
  {"before the first occurrence",            "CalcFirstInverseConcatenation", {"abcabc", "Any", "bc"}, 1, "a"},
  {"found elsewhere, cut by length",         "CalcSecondInverseConcatenation", {"xabc", "abc", "Any"}, 1, "c"},
  {"letters alone",                          "CalcLowerValue", {"Any", "@A[\xc4`1"}, 1, "@a[\xc4`1"},
  {"min as an unknown fold",                 "CalcInverseLowerValue", {"Any", "Min"}, 1, "Nil"},
};
// clang-format on

TEST(SingleState, Examples) {
  for (const Example& example : kExamples) CheckExample<Str>(example);
}

TEST(SingleState, ConstructionAndCopies) {
  const Str stale(kAnyTag, "old"), staleNil(kNilTag, "old");
  EXPECT_EQ(Of(ZORVadSingleString()), kAny);
  EXPECT_EQ(Of(ZORVadSingleString(ZORString("ab"))), Str("ab"));
  EXPECT_EQ(Of(ZORVadSingleString("ab")), Str("ab"));
  EXPECT_EQ(Of(ZORVadSingleString(HeldSingle(kMax).value)), kMax);
  EXPECT_EQ(Of(ZORVadSingleString(HeldSingle(stale).value)), Str(kAnyTag, ""));
  EXPECT_EQ(Of(ZORVadSingleString(ZorStreamableInit)).text, "");
  HeldSingle copied("ab");
  EXPECT_EQ(copied.value.Copy(HeldSingle(staleNil).value), 0);
  EXPECT_EQ(copied.Now(), Str(kNilTag, "ab"));
  EXPECT_EQ(copied.value.Copy(ZORString("x")), 1);
  EXPECT_EQ(copied.value.Copy(copied.value), 1);
  EXPECT_EQ(copied.Now(), Str("x"));
  EXPECT_EQ(Of(copied.value = "y"), Str("y"));
  EXPECT_EQ(Of(copied.value = HeldSingle(kMax).value), kMax);
}

TEST(SingleState, States) {
  for (const Str& v : {kNil, Str(kNilTag, "old"), Str(kNilTag, " "), kAny, Str(kAnyTag, "old"), kMin, kMax, Str("ab"),
                       Str(""), Str("  "), Str("z*255")}) {
    const bool nil = model::IsNil(v), any = model::IsAny(v), min = v == kMin, max = model::IsMax(v);
    const HeldSingle held(v);
    const ZORVadSingleString& value = held.value;
    EXPECT_EQ(std::tuple(value.IsNil(), value.CheckNil(), value.IsUndefined(), value.CheckAny(), value.IsEmpty(),
                         value.IsFull(), value.GetCardinality()),
              std::tuple(nil, nil, any, any, min, max,
                         nil   ? 0u
                         : any ? 255u
                               : 1u))
        << v;
    for (const ZORString& bound : {value.GetUpperBound(), value.GetNextExactValue("a"), value.GetPrevExactValue("a")})
      EXPECT_EQ(Plain(bound), v.text) << v;
    const struct {
      int answer;
      Str after;
      int (*change)(ZORVadSingleString& v);
    } changes[] = {{!nil, nil ? v : kNil, [](auto& x) { return x.Nil(); }},
                   {!any, any ? v : kAny, [](auto& x) { return x.Any(); }},
                   {0, kNil, [](auto& x) { return x.SetNilValue(), 0; }},
                   {0, kAny, [](auto& x) { return x.SetUndefinedValue(), 0; }},
                   {!min, kMin, [](auto& x) { return x.CalcMinValue(); }},
                   {!min, kMin, [](auto& x) { return x.CalcEmptyValue(); }},
                   {!max, kMax, [](auto& x) { return x.CalcMaxValue(); }},
                   {!max, kMax, [](auto& x) { return x.CalcFullValue(); }},
                   {0, nil ? v : kNil,
                    [](auto& x) { return x.Bisect(Missing<ZORVaDoObject>(), ZORVaDoAny::ValueSelection(9)), 0; }}};
    for (const auto& [answer, after, change] : changes) {
      HeldSingle changed(v);
      EXPECT_EQ(change(changed.value), answer) << v;
      EXPECT_EQ(changed.Now(), after) << v;
    }
  }
}

// Forward any class of integer is narrowed; backward all but the single one are a contradiction.
TEST(SingleState, LengthsOfOtherClasses) {
  HeldSingle held("abc");
  ZORVadIntervalInteger interval(2, 5);
  EXPECT_EQ(held.value.CalcLength(interval), 1);
  EXPECT_TRUE(interval.GetLower() == 3 && interval.GetUpper() == 3);
  EXPECT_EQ(held.value.CalcLength(interval), 0);
  EXPECT_EQ(held.value.CalcInverseLength(interval), 1);
  EXPECT_EQ(held.Now(), kNil);
  EXPECT_EQ(held.value.CalcInverseLength(ZORVadEnumInteger()), 0);
}

// What relations with a set, an integer, and nothing at all make of an open Boolean.
TEST(SingleState, RelationsWithOthers) {
  const auto tell = [](const char* z, const auto& x) {
    const HeldSingle held(z);
    const ZORVaDoString& value = held.value;
    return std::string{static_cast<char>(TellOf([&](auto& truth) { return value.CalcIsEqual(x, truth); })),
                       static_cast<char>(TellOf([&](auto& truth) { return value.CalcIsLessOrEqual(x, truth); })),
                       static_cast<char>(TellOf([&](auto& truth) { return value.CalcIsLess(x, truth); }))};
  };
  const ZORVadSingleInteger one(1), any;
  for (const char* z : {"abc", "Min", "Max"}) {
    EXPECT_EQ(tell(z, one), "nnn") << z;
    EXPECT_EQ(tell(z, any), "uun") << z;
    EXPECT_EQ(tell(z, Missing<ZORVaDoScalar>()), "nnn") << z;
  }
  EXPECT_EQ(tell("Any", Missing<ZORVaDoScalar>()), "uun");
  EXPECT_EQ(tell("b", HeldSet("{a,c}").value), "foo");
  EXPECT_EQ(tell("Min", HeldSet("Min").value), "ttf") << "both the least, of other texts";
  HeldSingle held("abc");
  EXPECT_EQ(held.value.CalcUnequalValue(one), 0);
  EXPECT_EQ(held.value.CalcUnequalValue(HeldSet("{abc,b}").value), 0);
  EXPECT_EQ(held.value.CalcUnequalValue(HeldSet("{abc}").value), 1);
  EXPECT_EQ(held.Now(), kNil);
}
