// Lower and upper case of single strings.
#include "tests/support/check.h"

using namespace zor::test;

// clang-format off
static const Str abc = Text("abc");

static const Row<0, Str, Str> kLower[] = {  // why, {z, x}, answer, z afterwards
  {"the fold is taken",             {kAny, Text("AbC")},        1, abc},
  {"it is there",                   {abc, Text("AbC")},         0, abc},
  {"another is there",              {Text("abd"), Text("AbC")}, 1, kNil},
  {"letters alone",                 {kAny, Text("@A[\xc4`1")},  1, Text("@a[\xc4`1")},
  {"a fold of something unknown",   {abc, kAny},                0, abc},
  {"a fold of nothing",             {Text("aBc"), kAny},        1, kNil},
  {"a nil target comes first",      {kNil, kMin},               0, kNil},
};
static const Row<1, Str, Str> kFromLower[] = {  // why, {z, x}, answer, x afterwards
  {"a text that folds to it",       {abc, Text("ABC")},         0, Text("ABC")},
  {"one that does not",             {abc, Text("ABD")},         1, kNil},
  {"many could",                    {abc, kAny},                0, kAny},
  {"none could",                    {Text("aBc"), kAny},        1, kNil},
  {"min of something unknown",      {kMin, kAny},               1, kNil},
  {"min as an unknown fold",        {kAny, kMin},               1, kNil},
};
static const Row<0, Str, Str> kUpper[] = {
  {"the fold is taken",             {kAny, Text("`aBz{")},      1, Text("`ABZ{")},
  {"max by its state",              {kAny, kMax},               1, kMax},
};
static const Row<1, Str, Str> kFromUpper[] = {{"a text that folds to it", {Text("ABC"), abc}, 0, abc}};
// clang-format on

TEST(SingleFold, Lower) { CheckRows(kLower, ZOR_OPERATION(CalcLowerValue)); }
TEST(SingleFold, FromLower) { CheckRows(kFromLower, ZOR_OPERATION(CalcInverseLowerValue)); }
TEST(SingleFold, Upper) { CheckRows(kUpper, ZOR_OPERATION(CalcUpperValue)); }
TEST(SingleFold, FromUpper) { CheckRows(kFromUpper, ZOR_OPERATION(CalcInverseUpperValue)); }
