// Length of single strings.
#include "tests/support/check.h"

using namespace zor::test;

// clang-format off
static const Str abc = Text("abc");

static const Row<1, Str, Int> kLengths[] = {  // why, {string, integer}, answer, integer afterwards
  {"a length is taken",                     {abc, kAnyNumber},          1, Number(3)},
  {"it is there",                           {abc, Number(3)},           0, Number(3)},
  {"another is there",                      {abc, Number(4)},           1, kNoNumber},
  {"the empty text",                        {Text(""), kAnyNumber},     1, Number(0)},
  {"max",                                   {kMax, kAnyNumber},         1, Number(255)},
  {"an open string overwrites",             {kAny, Number(3)},          1, kAnyNumber},
  {"nil",                                   {kNil, kAnyNumber},         1, kNoNumber},
};
static const Row<0, Str, Int> kFromLengths[] = {  // why, {string, integer}, answer, string afterwards
  {"it fits",                               {Text(""), Number(0)},      0, Text("")},
  {"it does not",                           {Text("abcd"), Number(3)},  1, kNil},
  {"a length tells an open string nothing", {kAny, Number(256)},        0, kAny},
  {"below 0 there is none",                 {kAny, Number(-1)},         1, kNil},
  {"the least number is one",               {kAny, Number(INT_MIN)},    1, kNil},
  {"no length",                             {kAny, kNoNumber},          1, kNil},
  {"an open length",                        {abc, kAnyNumber},          0, abc},
  {"a nil string",                          {{kNilTag, "a"}, Number(3)}, 0, {kNilTag, "a"}},
};
// clang-format on

TEST(SingleLength, Forward) { CheckRows(kLengths, ZOR_OPERATION(CalcLength)); }
TEST(SingleLength, Inverse) { CheckRows(kFromLengths, ZOR_OPERATION(CalcInverseLength)); }

// Forward any class of integer is narrowed; backward all but the single one are a contradiction.
TEST(SingleLength, OtherIntegers) {
  HeldSingle held(abc);
  ZORVadIntervalInteger interval(2, 5);
  EXPECT_EQ(held.value.CalcLength(interval), 1);
  EXPECT_TRUE(interval.GetLower() == 3 && interval.GetUpper() == 3);
  EXPECT_EQ(held.value.CalcLength(interval), 0);
  EXPECT_EQ(held.value.CalcInverseLength(interval), 1);
  EXPECT_EQ(held.Now(), kNil);
  EXPECT_EQ(held.value.CalcInverseLength(ZORVadEnumInteger()), 0);
}
