// Worked examples of the operations on single strings, which the model of them is measured by as well.
#include "tests/support/check.h"

using namespace zor::test;

// clang-format off
#define Z2(Name)     ZOR_EXAMPLE(Name, 0, Str, Str)
#define X2(Name)     ZOR_EXAMPLE(Name, 1, Str, Str)
#define Z3(Name)     ZOR_EXAMPLE(Name, 0, Str, Str, Str)
#define X3(Name)     ZOR_EXAMPLE(Name, 1, Str, Str, Str)
#define Y3(Name)     ZOR_EXAMPLE(Name, 2, Str, Str, Str)
#define LENGTH       ZOR_EXAMPLE(CalcLength, 1, Str, Int)
#define FROM_LENGTH  ZOR_EXAMPLE(CalcInverseLength, 0, Str, Int)
#define SLICE        ZOR_EXAMPLE(CalcSubString, 0, Str, Str, Int, Int)
#define SOURCE       ZOR_EXAMPLE(CalcFirstInverseSubString, 1, Str, Str, Int, Int)
#define START        ZOR_EXAMPLE(CalcSecondInverseSubString, 2, Str, Str, Int, Int)
#define END          ZOR_EXAMPLE(CalcThirdInverseSubString, 3, Str, Str, Int, Int)

static const Example kExamples[] = {  // why, operation, operands, answer, target afterwards, answer to a second call
  {"an extreme replaces a text",             Z2(CalcEqualValue), {"abc", "Min"}, 1, "Min"},
  {"no text an extreme",                     Z2(CalcEqualValue), {"Max", "abc"}, 1, "Nil"},
  {"equal texts meet",                       Z2(IsIntersected), {"abc", "abc"}, 1, "abc", 1},
  {"the text itself goes",                   Z2(CalcUnequalValue), {"abc", "abc"}, 1, "Nil"},

  {"equal is not less",                      Z2(CalcLessValue), {"abc", "abc"}, 1, "Nil"},
  {"a prefix comes first",                   X2(CalcInverseLessValue), {"ab", "ab "}, 0, "ab "},
  {"codes are unsigned",                     Z2(CalcNotLessValue), {"z", "\xff"}, 1, "Nil"},
  {"max is not less than itself",            X2(CalcInverseLessValue), {"Max", "Max"}, 1, "Nil"},
  {"nothing lies above max",                 Z2(CalcLessOrEqualValue), {"Max", "\xff"}, 1, "Nil"},
  {"nothing lies below min",                 X2(CalcInverseNotLessAndUnequalValue), {"Min", ""}, 1, "Nil"},
  {"nil before undefined",                   X2(CalcInverseNotLessValue), {"Nil", "Any"}, 1, "Nil"},

  {"the lesser one contradicts",             Z3(CalcMaxValue), {"abc", "abc", "abd"}, 1, "Nil"},
  {"max contradicts even its own text",      Z3(CalcMaxValue), {"z*255", "abc", "Max"}, 1, "Nil"},
  {"any operand overwrites nil",             Z3(CalcMaxValue), {"Nil", "Any", "abc"}, 1, "Any"},
  {"max leaves the other",                   Z3(CalcMinValue), {"Any", "Max", "abc"}, 1, "abc"},
  {"two max overwrite a text",               Z3(CalcMinValue), {"abc", "Max", "Max"}, 1, "Max"},
  {"the maximum is y",                       X3(CalcFirstInverseMaxValue), {"abd", "Any", "abd"}, 0, "Any"},
  {"below both",                             X3(CalcFirstInverseMaxValue), {"abc", "Any", "abd"}, 1, "Nil"},
  {"an open maximum",                        X3(CalcFirstInverseMaxValue), {"Any", "abc", "abd"}, 1, "Any"},
  {"the minimum may be both",                X3(CalcFirstInverseMinValue), {"abc", "Any", "abc"}, 1, "abc"},
  {"a space more",                           Z2(CalcNextValue), {"Any", "ab"}, 1, "ab "},
  {"there z goes, the one before steps",     Z2(CalcNextValue), {"Any", "a*253zz"}, 1, "a*252b"},
  {"none of z alone",                        Z2(CalcNextValue), {"Any", "z*255"}, 1, "Max"},
  {"its own successor",                      Z2(CalcNextValue), {"Max", "z*255"}, 0, "Max"},
  {"above the limit nothing is filled",      X2(CalcInverseNextValue), {"a*299y", "Any"}, 1, "a*299x"},
  {"of max by its text",                     X2(CalcInverseNextValue), {"Max", "Any"}, 1, "z*254y"},
  {"none of min",                            X2(CalcInverseNextValue), {"Min", "Any"}, 1, "Nil"},

  {"a nil target comes before any operand",  Z3(CalcConcatenation), {"Nil", "Any", "b"}, 0, "Nil"},
  {"any operand overwrites a known target",  Z3(CalcConcatenation), {"ab", "a", "Any"}, 1, "Any"},
  {"another one is there",                   Z3(CalcConcatenation), {"abcdef", "abc", "deg"}, 1, "Nil"},
  {"empty and space are min",                Z3(CalcConcatenation), {"Any", "", "Min"}, 1, "Min"},
  {"255 characters are still a text",        Z3(CalcConcatenation), {"Any", "z*200", "z*55"}, 1, "z*255"},
  {"256 characters are max",                 Z3(CalcConcatenation), {"abc", "a*200", "b*56"}, 1, "Max"},
  {"before the first occurrence",            X3(CalcFirstInverseConcatenation), {"abcabc", "Any", "bc"}, 1, "a"},
  {"a max result overwrites a known target", X3(CalcFirstInverseConcatenation), {"Max", "a", "b"}, 1, "Any"},
  {"found elsewhere, cut by length",         Y3(CalcSecondInverseConcatenation), {"xabc", "abc", "Any"}, 1, "c"},

  {"cut at the end",                         SLICE, {"Any", "abcdef", "4", "2147483646"}, 1, "ef"},
  {"a count that wraps",                     SLICE, {"Any", "abcdef", "0", "2147483647"}, 1, ""},
  {"min whatever the positions",             SLICE, {"Nil", "Min", "Nil", "1"}, 1, "Min"},
  {"an open source learns nothing",          SOURCE, {"bcd", "Any", "1", "3"}, 0, "Any"},
  {"open positions before nil ones",         SOURCE, {"bcd", "abcdef", "Any", "Nil"}, 1, "Any"},
  {"another text before it",                 START, {"bcd", "abcdef", "Any", "4"}, 1, "Nil"},
  {"the empty text fits anywhere, wrapping", START, {"", "abcdef", "Any", "2147483647"}, 1, "-2147483648"},
  {"behind a known start",                   END, {"bcd", "abcdef", "1", "Any"}, 1, "3"},
  {"an open start tells nothing",            END, {"bcd", "abcdef", "Any", "5"}, 0, "5"},

  {"letters alone",                          Z2(CalcLowerValue), {"Any", "@A[\xc4`1"}, 1, "@a[\xc4`1"},
  {"a fold of nothing",                      Z2(CalcLowerValue), {"aBc", "Any"}, 1, "Nil"},
  {"max by its state",                       Z2(CalcUpperValue), {"Any", "Max"}, 1, "Max"},
  {"one that does not",                      X2(CalcInverseUpperValue), {"ABC", "abd"}, 1, "Nil"},
  {"min as an unknown fold",                 X2(CalcInverseLowerValue), {"Any", "Min"}, 1, "Nil"},

  {"a length is taken",                      LENGTH, {"abc", "Any"}, 1, "3"},
  {"it is there",                            LENGTH, {"abc", "3"}, 0, "3"},
  {"another is there",                       LENGTH, {"abc", "4"}, 1, "Nil"},
  {"max",                                    LENGTH, {"Max", "Any"}, 1, "255"},
  {"an open string overwrites",              LENGTH, {"Any", "3"}, 1, "Any"},
  {"nil",                                    LENGTH, {"Nil", "Any"}, 1, "Nil"},
  {"it fits",                                FROM_LENGTH, {"", "0"}, 0, ""},
  {"it does not",                            FROM_LENGTH, {"abcd", "3"}, 1, "Nil"},
  {"an open string learns nothing",          FROM_LENGTH, {"Any", "256"}, 0, "Any"},
  {"but for lengths below 0",                FROM_LENGTH, {"Any", "-2147483648"}, 1, "Nil"},
  {"no length",                              FROM_LENGTH, {"Any", "Nil"}, 1, "Nil"},
  {"an open length",                         FROM_LENGTH, {"abc", "Any"}, 0, "abc"},
  {"a nil string",                           FROM_LENGTH, {"Nil", "3"}, 0, "Nil"},

  {"a text in its quotes",                   Z2(CalcStringRepresentation), {"Any", "abc"}, 1, "\"abc\"", 1},
  {"no text form",                           X2(CalcInverseStringRepresentation), {"abc", "abc"}, 1, "Nil", 1},
};
// clang-format on

TEST(SingleExamples, EachInBothForms) {
  for (const Example& example : kExamples) example.check(example);
}

// Forward any class of integer is narrowed; backward all but the single one are a contradiction.
TEST(SingleExamples, LengthsOfOtherClasses) {
  HeldSingle held(Text("abc"));
  ZORVadIntervalInteger interval(2, 5);
  EXPECT_EQ(held.value.CalcLength(interval), 1);
  EXPECT_TRUE(interval.GetLower() == 3 && interval.GetUpper() == 3);
  EXPECT_EQ(held.value.CalcLength(interval), 0);
  EXPECT_EQ(held.value.CalcInverseLength(interval), 1);
  EXPECT_EQ(held.Now(), kNil);
  EXPECT_EQ(held.value.CalcInverseLength(ZORVadEnumInteger()), 0);
}
