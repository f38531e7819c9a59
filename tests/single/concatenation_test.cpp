// Concatenation and substring of single strings.
#include "tests/support/check.h"

using namespace zor::test;

// clang-format off
static const Str f = Text("abcdef"), abc = Text("abc"), abcabc = Text("abcabc"), bcd = Text("bcd");
static const Int kAnyN = kAnyNumber, kNilN = kNoNumber, n1 = Number(1), n3 = Number(3);

static const Row<0, Str, Str, Str> kSums[] = {  // why, {z, x, y}, answer, z afterwards
  {"a nil target comes before any operand",  {kNil, kAny, Text("b")},                   0, kNil},
  {"any operand overwrites a known target",  {Text("ab"), Text("a"), kAny},             1, kAny},
  {"max again",                              {kMax, Text("a"), kMax},                   0, kMax},
  {"the sum is taken",                       {kAny, abc, Text("def")},                  1, f},
  {"the sum is there",                       {f, abc, Text("def")},                     0, f},
  {"another one is there",                   {f, abc, Text("deg")},                     1, kNil},
  {"empty and space are min",                {kAny, Text(""), kMin},                    1, kMin},
  {"255 characters are still a text",        {kAny, Times(200, 'z'), Times(55, 'z')},   1, Times(255, 'z')},
  {"256 characters are max",                 {abc, Times(200, 'a'), Times(56, 'b')},    1, kMax},
};
static const Row<1, Str, Str, Str> kHeads[] = {  // why, {z, x, y}, answer, x afterwards
  {"before the first occurrence",            {abcabc, kAny, Text("bc")},                1, Text("a")},
  {"at the start",                           {abcabc, kAny, abc},                       1, Text("")},
  {"nowhere",                                {abc, kAny, Text("d")},                    1, kNil},
  {"a max result overwrites a known target", {kMax, Text("a"), Text("b")},              1, kAny},
};
static const Row<2, Str, Str, Str> kTails[] = {  // why, {z, x, y}, answer, y afterwards
  {"behind the head",                        {abcabc, abc, kAny},                       1, abc},
  {"found elsewhere, cut by length",         {Text("xabc"), abc, kAny},                 1, Text("c")},
  {"nothing is left",                        {abc, abc, kAny},                          1, Text("")},
  {"the empty head leaves all",              {abc, Text(""), kAny},                     1, abc},
};
static const Row<0, Str, Str, Int, Int> kSlices[] = {  // why, {z, x, start, end}, answer, z afterwards
  {"both ends in",                           {kAny, f, n1, n3},                         1, bcd},
  {"one character",                          {kAny, f, n3, n3},                         1, Text("d")},
  {"none",                                   {kAny, f, Number(2), n1},                  1, Text("")},
  {"cut at the end",                         {kAny, f, Number(4), Number(INT_MAX - 1)}, 1, Text("ef")},
  {"a count that wraps",                     {kAny, f, Number(0), Number(INT_MAX)},     1, Text("")},
  {"min whatever the positions",             {kNil, kMin, kNilN, n1},                   1, kMin},
  {"any from nil",                           {kNil, kAny, n1, n3},                      1, kAny},
};
static const Row<1, Str, Str, Int, Int> kSources[] = {  // why, {z, x, start, end}, answer, x afterwards
  {"a source that fits",                     {bcd, Text("xbcdy"), n1, n3},              0, Text("xbcdy")},
  {"an open one learns nothing",             {bcd, kAny, n1, n3},                       0, kAny},
  {"open positions before nil ones",         {bcd, f, kAnyN, kNilN},                    1, kAny},
};
static const Row<2, Str, Str, Int, Int> kStarts[] = {  // why, {z, x, start, end}, answer, start afterwards
  {"before a known end",                     {bcd, f, kAnyN, n3},                       1, n1},
  {"another text before it",                 {bcd, f, kAnyN, Number(4)},                1, kNilN},
  {"the first occurrence",                   {Text("bc"), abcabc, kAnyN, kAnyN},        1, n1},
  {"the empty text fits anywhere, wrapping", {Text(""), f, kAnyN, Number(INT_MAX)},     1, Number(INT_MIN)},
};
static const Row<3, Str, Str, Int, Int> kEnds[] = {  // why, {z, x, start, end}, answer, end afterwards
  {"behind a known start",                   {bcd, f, n1, kAnyN},                       1, n3},
  {"the first occurrence",                   {bcd, f, kAnyN, kAnyN},                    1, n3},
  {"no occurrence",                          {Text("xy"), f, kAnyN, kAnyN},             1, kNilN},
  {"an open start tells nothing",            {bcd, f, kAnyN, Number(5)},                0, Number(5)},
};
// clang-format on

TEST(SingleConcatenation, Forward) { CheckRows(kSums, ZOR_OPERATION(CalcConcatenation)); }
TEST(SingleConcatenation, FirstInverse) { CheckRows(kHeads, ZOR_OPERATION(CalcFirstInverseConcatenation)); }
TEST(SingleConcatenation, SecondInverse) { CheckRows(kTails, ZOR_OPERATION(CalcSecondInverseConcatenation)); }
TEST(SingleSubString, Forward) { CheckRows(kSlices, ZOR_OPERATION(CalcSubString)); }
TEST(SingleSubString, FirstInverse) { CheckRows(kSources, ZOR_OPERATION(CalcFirstInverseSubString)); }
TEST(SingleSubString, SecondInverse) { CheckRows(kStarts, ZOR_OPERATION(CalcSecondInverseSubString)); }
TEST(SingleSubString, ThirdInverse) { CheckRows(kEnds, ZOR_OPERATION(CalcThirdInverseSubString)); }
