// The four relations of order on sets of texts.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

// clang-format off
const SetRow kLessOrEqual[] = {  // why, {z, x}, answer, z afterwards
  {"what lies above goes",                        {"{a,m}", "{c}"},         1, "{a}"},
  {"equal ends",                                  {"{a,c}", "{c}"},         0, "{a,c}"},
  {"all lies above",                              {"{d}", "{c}"},           1, "Nil"},
  {"the max is cut too",                          {"{a,Max}", "{c}"},       1, "{a}"},
  {"max on both sides",                           {"{a,Max}", "{b,Max}"},   0, "{a,Max}"},
  {"nothing lies below min",                      {"Min", "Min"},           0, "Min"},
  {"all others lie above it",                     {"{,a}", "Min"},          1, "Nil"},
  {"nothing lies above the greatest",             {"{a,Max}", "Max"},       0, "{a,Max}"},
  {"which lies above all others",                 {"Max", "{z*255}"},       1, "Nil"},
};
const SingleRow kLessOrEqualSingle[] = {
  {"as a set of one text",                        {"{a,m}", Text("c")},     1, "{a}"},
  {"one space is min",                            {"{a}", kMin},            1, "Nil"},
};
const SetInverse kInverseLessOrEqual[] = {  // why, {z, x}, answer, x afterwards
  {"the bound comes in",                          {"{c,m}", "{a,d}"},       1, "{c,d}"},
  {"also when all lies below",                    {"{c}", "{a}"},           1, "{c}"},
  {"x lies above",                                {"{c}", "{d}"},           0, "{d}"},
  {"max stays, c comes in",                       {"{c}", "{a,Max}"},       1, "{c,Max}"},
  {"the greatest comes in as a text",             {"Max", "{a}"},           1, "{z*255}"},
};
const SingleInverse kInverseLessOrEqualSingle[] = {
  {"a single x takes the bound",                  {"{c}", Text("a")},       1, Text("c")},
};
const SetRow kNotLess[] = {
  {"the bound comes in",                          {"{a,m}", "{c}"},         1, "{c,m}"},
  {"also when all lies below",                    {"{a}", "{c}"},           1, "{c}"},
  {"z lies above",                                {"{d,m}", "{c}"},         0, "{d,m}"},
};
const SetInverse kInverseNotLess[] = {
  {"what lies above goes",                        {"{m}", "{a,z}"},         1, "{a}"},
};
const SingleInverse kInverseNotLessSingle[] = {
  {"above all",                                   {"{a,m}", Text("z")},     1, kNil},
  {"equal",                                       {"{a,m}", Text("m")},     0, Text("m")},
  {"between",                                     {"{a,m}", Text("b")},     0, Text("b")},
  {"the max beside texts does not count",         {"{a,Max}", Text("b")},   1, kNil},
  {"alone it does",                               {"Max", Times(255, 'z')}, 0, Times(255, 'z')},
  {"min compares as the empty text",              {"Min", kMin},            1, kNil},
};
const SetRow kLess[] = {
  {"equal ends",                                  {"{a}", "{a}"},           1, "Nil"},
  {"the greatest texts alone are compared",       {"{a,z}", "{m}"},         1, "Nil"},
  {"max is below nothing",                        {"{a,Max}", "{b,Max}"},   1, "Nil"},
  {"the bound of min is one space",               {"Min", "{ }"},           1, "Nil"},
};
const SetRow kGreater[] = {
  {"above",                                       {"{z}", "{m}"},           0, "{z}"},
  {"below",                                       {"{a}", "{m}"},           1, "Nil"},
  {"equal ends",                                  {"{a,z}", "{z}"},         1, "Nil"},
};
const SetInverse kInverseGreater[] = {
  {"nothing is cut",                              {"{m}", "{a,z}"},         1, "Nil"},
};
const SingleInverse kInverseGreaterSingle[] = {
  {"equal",                                       {"{a,m}", Text("m")},     1, kNil},
  {"between",                                     {"{a,m}", Text("b")},     0, Text("b")},
};
const SingleRow kNoForm[] = {
  {"no form for a single x",                      {"{b}", Text("a")},       0, "{b}"},
  {"nor for a nil one",                           {"{b}", kNil},            0, "{b}"},
};
// clang-format on

TEST(EnumOrder, Sets) {
  CheckRows(kLessOrEqual, ZOR_OPERATION(CalcLessOrEqualValue));
  CheckRows(kInverseLessOrEqual, ZOR_OPERATION(CalcInverseLessOrEqualValue));
  CheckRows(kNotLess, ZOR_OPERATION(CalcNotLessValue));
  CheckRows(kInverseNotLess, ZOR_OPERATION(CalcInverseNotLessValue));
  CheckRows(kLess, ZOR_OPERATION(CalcLessValue));
  CheckRows(kGreater, ZOR_OPERATION(CalcNotLessAndUnequalValue));
  CheckRows(kInverseGreater, ZOR_OPERATION(CalcInverseNotLessAndUnequalValue));
}

TEST(EnumOrder, Singles) {
  CheckRows(kLessOrEqualSingle, ZOR_OPERATION(CalcLessOrEqualValue));
  CheckRows(kInverseLessOrEqualSingle, ZOR_OPERATION(CalcInverseLessOrEqualValue));
  CheckRows(kInverseNotLessSingle, ZOR_OPERATION(CalcInverseNotLessValue));
  CheckRows(kInverseGreaterSingle, ZOR_OPERATION(CalcInverseNotLessAndUnequalValue));
  CheckRows(kNoForm, ZOR_ENTRY(CalcLessValue));
  CheckRows(kNoForm, ZOR_ENTRY(CalcInverseLessValue));
  CheckRows(kNoForm, ZOR_ENTRY(CalcNotLessValue));
  CheckRows(kNoForm, ZOR_ENTRY(CalcNotLessAndUnequalValue));
}

}  // namespace
}  // namespace zor::test
