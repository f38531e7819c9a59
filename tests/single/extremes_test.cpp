// Minimum, maximum and successor of single strings.
#include "tests/support/check.h"

using namespace zor::test;

// clang-format off
static const Str a = Text("abc"), b = Text("abd");

static const Row<0, Str, Str, Str> kMaxima[] = {  // why, {z, x, y}, answer, z afterwards
  {"the greater one",                   {kAny, a, b},                 1, b},
  {"the lesser one contradicts",        {a, a, b},                    1, kNil},
  {"max is taken",                      {kAny, kMax, a},              1, kMax},
  {"max contradicts even its own text", {Times(255, 'z'), a, kMax},   1, kNil},
  {"any operand overwrites nil",        {kNil, kAny, a},              1, kAny},
};
static const Row<0, Str, Str, Str> kMinima[] = {  // why, {z, x, y}, answer, z afterwards
  {"min is taken",                      {kAny, a, kMin},              1, kMin},
  {"max leaves the other",              {kAny, kMax, a},              1, a},
  {"two max overwrite a text",          {a, kMax, kMax},              1, kMax},
  {"and nil",                           {kNil, kMax, kMax},           1, kMax},
};
static const Row<1, Str, Str, Str> kFromMaximum[] = {  // why, {z, x, y}, answer, x afterwards
  {"the result is x",                   {b, kAny, a},                 1, b},
  {"the result is y",                   {b, kAny, b},                 0, kAny},
  {"below both",                        {a, kAny, b},                 1, kNil},
  {"a nil target stays",                {kAny, {kNilTag, "a"}, a},    0, {kNilTag, "a"}},
  {"nil before an open result",         {kAny, a, kNil},              1, kNil},
  {"an open result",                    {kAny, a, b},                 1, kAny},
};
static const Row<1, Str, Str, Str> kFromMinimum[] = {  // why, {z, x, y}, answer, x afterwards
  {"it may be both",                    {a, kAny, a},                 1, a},
  {"above both",                        {b, kAny, a},                 1, kNil},
  {"an open result",                    {kAny, a, b},                 1, kAny},
};
static const Row<0, Str, Str> kSuccessors[] = {  // why, {z, x}, answer, z afterwards
  {"a space more",                      {kAny, Text("ab")},           1, Text("ab ")},
  {"of the empty text",                 {kAny, Text("")},             1, kMin},
  {"up to the limit",                   {kAny, Times(254, 'a')},      1, Times(254, 'a', " ")},
  {"at the limit the last one steps",   {kAny, Times(254, 'a', "y")}, 1, Times(254, 'a', "z")},
  {"z goes, the one before steps",      {kAny, Times(253, 'a', "zz")}, 1, Times(252, 'a', "b")},
  {"none of z alone",                   {kAny, Times(255, 'z')},      1, kMax},
  {"its own successor",                 {kMax, Times(255, 'z')},      0, kMax},
  {"none of max",                       {kAny, kMax},                 1, kNil},
};
static const Row<1, Str, Str> kPredecessors[] = {  // why, {z, x}, answer, x afterwards
  {"one below, then z",                 {Text("ab"), kAny},           1, Text("aa" + std::string(253, 'z'))},
  {"of a space the text before it",     {Text("ab "), kAny},          1, Text("ab" + std::string(253, 'z'))},
  {"down to a space",                   {Text("a!"), kAny},           1, Text("a " + std::string(253, 'z'))},
  {"at the limit",                      {Times(253, 'a', "zz"), kAny}, 1, Times(253, 'a', "zy")},
  {"of max by its text",                {kMax, kAny},                 1, Times(254, 'z', "y")},
  {"above the limit nothing is filled", {Times(299, 'a', "y"), kAny}, 1, Times(299, 'a', "x")},
  {"none of min",                       {kMin, kAny},                 1, kNil},
  {"none of nil, whatever its text",    {{kNilTag, "ab"}, kAny},      1, kNil},
};
// clang-format on

TEST(SingleExtremes, Maximum) { CheckRows(kMaxima, ZOR_OPERATION(CalcMaxValue)); }
TEST(SingleExtremes, Minimum) { CheckRows(kMinima, ZOR_OPERATION(CalcMinValue)); }
TEST(SingleExtremes, FromMaximum) { CheckRows(kFromMaximum, ZOR_OPERATION(CalcFirstInverseMaxValue)); }
TEST(SingleExtremes, FromMinimum) { CheckRows(kFromMinimum, ZOR_OPERATION(CalcFirstInverseMinValue)); }
TEST(SingleExtremes, Successor) { CheckRows(kSuccessors, ZOR_OPERATION(CalcNextValue)); }
TEST(SingleExtremes, Predecessor) { CheckRows(kPredecessors, ZOR_OPERATION(CalcInverseNextValue)); }
