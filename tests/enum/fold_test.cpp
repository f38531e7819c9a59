// Lower and upper case of sets of texts.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

// clang-format off
const SetRow kLower[] = {  // why, {z, x}, answer, z afterwards
  {"two texts of one fold",                 {"Any", "{AB,Cd,ab}"},        1, "{ab,cd}"},
  {"what is no fold goes",                  {"{a,c}", "{A,B}"},           1, "{a}"},
  {"nothing goes",                          {"{a}", "{A,B}"},             0, "{a}"},
  {"nothing stays",                         {"{c}", "{A,B}"},             1, "Nil"},
  {"max is not carried",                    {"Any", "{A,Max}"},           1, "{a}"},
  {"nor met",                               {"Max", "{A,Max}"},           1, "Nil"},
  {"nor lost",                              {"{a,Max}", "{A,Max}"},       0, "{a,Max}"},
  {"the least folds to itself",             {"Any", "Min"},               1, "Min"},
  {"it alone",                              {"{,a}", "Min"},              1, "Nil"},
  {"the greatest too",                      {"Any", "Max"},               1, "Max"},
  {"a set with texts is not it",            {"{a,Max}", "Max"},           1, "Nil"},
  {"open tells nothing, also of a capital", {"{A}", "Any"},               0, "{A}"},
};
const SetRow kUpper[] = {
  {"the other way",                         {"Any", "{AB,Cd,ab}"},        1, "{AB,CD}"},
};
const SingleRow kLowerSingle[] = {
  {"taken",                                 {"Any", Text("Ab")},          1, "{ab}"},
  {"the first text alone is compared",      {"{a,b}", Text("A")},         0, "{a,b}"},
  {"the second is not",                     {"{a,b}", Text("B")},         1, "Nil"},
  {"one space is min, listed as such",      {"Any", kMin},                1, "Min"},
  {"the greatest is not a text",            {"Max", Times(255, 'z')},     1, "Nil"},
  {"open",                                  {"{A}", kAny},                0, "{A}"},
};
const SetInverse kInverseLower[] = {  // why, {z, x}, answer, x afterwards
  {"text by text",                          {"{a,b}", "{A,B}"},           0, "{A,B}"},
  {"another number of texts",               {"{a,b}", "{A}"},             1, "Nil"},
  {"folding changes the order",             {"{a,b}", "{B,a}"},           1, "Nil"},
  {"max takes no part",                     {"{a,Max}", "{A}"},           0, "{A}"},
  {"both the least",                        {"Min", "Min"},               0, "Min"},
  {"an open x at an extreme",               {"Max", "Any"},               1, "Nil"},
  {"an open x where some text is a fold",   {"{A,b}", "Any"},             0, "Any"},
  {"where none is",                         {"{A,B}", "Any"},             1, "Nil"},
  {"the greatest is beside them",           {"{A,Max}", "Any"},           0, "Any"},
};
const SingleInverse kInverseLowerSingle[] = {
  {"it folds to it",                        {"{a}", Text("A")},           0, Text("A")},
  {"one of two",                            {"{a,b}", Text("A")},         1, kNil},
  {"both the least, though the texts differ", {"Min", kMin},              0, kMin},
  {"an open x",                             {"{a,B}", kAny},              0, kAny},
  {"where no text is a fold",               {"{A}", kAny},                1, kNil},
};
// clang-format on

TEST(EnumFold, Lower) {
  CheckRows(kLower, ZOR_OPERATION(CalcLowerValue));
  CheckRows(kLowerSingle, ZOR_OPERATION(CalcLowerValue));
  CheckRows(kInverseLower, ZOR_OPERATION(CalcInverseLowerValue));
  CheckRows(kInverseLowerSingle, ZOR_OPERATION(CalcInverseLowerValue));
}

TEST(EnumFold, Upper) {
  CheckRows(kUpper, ZOR_OPERATION(CalcUpperValue));
  Check(SetInverse{"text by text", {"{A,B}", "{a,b}"}, 0, "{a,b}"}, ZOR_OPERATION(CalcInverseUpperValue));
  Check(SingleInverse{"no fold", {"{A}", Text("b")}, 1, kNil}, ZOR_OPERATION(CalcInverseUpperValue));
}

TEST(EnumFold, Limits) {
  const Set folds = Many(256), more = Many(257), capitals = Many(256, "A");
  Check(SetRow{"256 folds", {"Any", capitals}, 1, folds}, ZOR_OPERATION(CalcLowerValue));
  Check(SetRow{"one more tells nothing", {"{q}", more}, 0, "{q}"}, ZOR_OPERATION(CalcLowerValue));
  Set ten{kExact, {}}, many{kExact, {}};  // 320 texts of five letters in either case, ten of them differ
  for (char last = '0'; last <= '9'; ++last) {
    ten.texts.push_back(std::string("abcde") + last);
    for (int cases = 0; cases < 32; ++cases) {
      many.texts.push_back(ten.texts.back());
      for (int i = 0; i < 5; ++i) many.texts.back()[i] ^= (cases >> i & 1) * 0x20;
    }
  }
  many.Sort();
  Check(SetRow{"320 texts of ten folds", {"Any", many}, 1, ten}, ZOR_OPERATION(CalcLowerValue));
}

}  // namespace
}  // namespace zor::test
