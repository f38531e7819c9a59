// Minimum, maximum and successor on sets of texts.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

// clang-format off
const SetsRow kMaximum[] = {  // why, {z, x, y}, answer, z afterwards, second answer
  {"the union from the greater of the bounds",    {"Any", "{a,c}", "{b,d}"},        1, "{b,c,d}", 1},
  {"what z lists stays",                          {"{z}", "{a}", "{b}"},            1, "{b,z}", 1},
  {"the bound is d",                              {"Any", "{d}", "{b}"},            1, "{d}", 1},
  {"two least texts make one space",              {"Any", "Min", "Min"},            1, "{ }", 1},
  {"the greatest decides",                        {"{a}", "Max", "{b}"},            1, "Max", 0},
  {"the max of a set with texts is lost",         {"{b,Max}", "{a,Max}", "{b}"},    1, "{b}", 1},
  {"nil",                                         {"Any", "Nil", "Max"},            1, "Nil", 0},
};
const SetsRow kMinimum[] = {
  {"the union up to the lesser of the bounds",    {"Any", "{a,c}", "{b,d}"},        1, "{a,b,c}", 1},
  {"the least decides",                           {"{a}", "Min", "{b}"},            1, "Min", 0},
  {"the greatest adds nothing",                   {"Any", "Max", "{b}"},            1, "{b}", 1},
  {"nor cuts",                                    {"{z}", "{b}", "Max"},            1, "{b,z}", 1},
  {"both are the greatest",                       {"{a}", "Max", "Max"},            1, "Max", 0},
  {"both bounds are the greatest",                {"Any", "{a,Max}", "{b,Max}"},    1, "{a,b}", 1},
  {"all lies above the greatest of the domain",   {"Any", "{z*256,Max}", "{z*256,Max}"}, 1, "Nil", 0},
};
const SetsRow kUnknownMaximum[] = {
  {"an open operand makes it open",               {"{a}", "Any", "{b}"},            1, "Any"},
  {"but for the greatest",                        {"{a}", "Any", "Max"},            1, "Max"},
};
const SetsRow kUnknownMinimum[] = {
  {"with an open x not above y",                  {"{a,m}", "Any", "{c}"},          1, "{a}"},
  {"with an open y not above x",                  {"{d}", "{c}", "Any"},            1, "Nil"},
};
const SetsRow kLearnsNothing[] = {
  {"nor with the greatest beside it",             {"{a,m}", "Max", "Any"},          0, "{a,m}"},
};
const SetsInverse kInverseMaximum[] = {  // why, {z, x, y}, answer, x afterwards
  {"an open x below another bound",               {"{d}", "Any", "{b}"},            0, "Any"},
  {"where y attains it",                          {"{d}", "Any", "{d}"},            1, "{d}"},
  {"an open y may",                               {"{d,Max}", "Any", "Any"},        1, "{d,Max}"},
  {"x can be it",                                 {"{d}", "{c}", "{b}"},            0, "{c}"},
  {"x lies below y, which is not it",             {"{d}", "{a}", "{b}"},            1, "Nil"},
  {"all share the bound",                         {"{d}", "{d}", "{d}"},            0, "{d}"},
  {"nil y",                                       {"{d}", "{d}", "Nil"},            1, "Nil"},
};
const SetsInverse kInverseMinimum[] = {
  {"x is it",                                     {"{a}", "{a}", "{c}"},            0, "{a}"},
  {"x lies above y, which is not it",             {"{a}", "{d}", "{c}"},            1, "Nil"},
  {"y attains it",                                {"{c}", "{d}", "{c}"},            0, "{d}"},
  {"all share the bound",                         {"{c}", "{b,c}", "{c}"},          0, "{b,c}"},
  {"an open x where y attains it",                {"{c}", "Any", "{c}"},            1, "{c}"},
};
const SetRow kNext[] = {  // why, {z, x}, answer, z afterwards, second answer
  {"a space is added, z is replaced",             {"{q}", "{ab}"},                  1, "{ab }", 1},
  {"up to the limit",                             {"Any", "{a*254}"},               1, "{a*254 }", 1},
  {"there z is dropped",                          {"Any", "{a*253zz}"},             1, "{a*252b}", 1},
  {"nothing but z has none",                      {"Any", "{z*255}"},               1, "{z*255}", 1},
  {"max is not carried",                          {"Any", "{a,Max}"},               1, "{a }", 1},
  {"min has no case of its own",                  {"Any", "Min"},                   1, "{ }", 1},
  {"the greatest",                                {"Any", "Max"},                   1, "Max", 0},
};
const SetInverse kPrevious[] = {  // why, {z, x}, answer, x afterwards, second answer
  {"one space",                                   {"{ }", "Any"},                   1, "Min", 1},
  {"filled with z",                               {"{b}", "{q}"},                   1, "{az*254}", 1},
  {"one for two",                                 {"{ab ,ac}", "Any"},              1, "{abz*253}", 1},
  {"the least",                                   {"Min", "{a}"},                   1, "Min", 0},
  {"the empty text has none",                     {"{, }", "{a}"},                  1, "Min", 1},
  {"and alone beside the max it is a contradiction", {"{,Max}", "{a}"},             1, "Nil", 0},
  {"a long one is not filled",                    {"{a*255b}", "Any"},              1, "{a*256}", 1},
  {"of the greatest: itself and the one below",   {"Max", "{a}"},                   1, "{z*254y,Max}", 1},
  {"max is not carried",                          {"{b,Max}", "Any"},               1, "{az*254}", 1},
};
// clang-format on

TEST(EnumExtremes, Forward) {
  CheckRows(kMaximum, ZOR_OPERATION(CalcMaxValue));
  CheckRows(kMinimum, ZOR_OPERATION(CalcMinValue));
  CheckRows(kUnknownMaximum, ZOR_TYPED(CalcMaxValue));
  CheckRows(kUnknownMinimum, ZOR_TYPED(CalcMinValue));
  CheckRows(kLearnsNothing, ZOR_ENTRY(CalcMaxValue));
  CheckRows(kLearnsNothing, ZOR_ENTRY(CalcMinValue));
}

TEST(EnumExtremes, Inverse) {
  CheckRows(kInverseMaximum, ZOR_OPERATION(CalcFirstInverseMaxValue));
  CheckRows(kInverseMinimum, ZOR_OPERATION(CalcFirstInverseMinValue));
}

TEST(EnumExtremes, Successor) {
  CheckRows(kNext, ZOR_OPERATION(CalcNextValue));
  CheckRows(kPrevious, ZOR_OPERATION(CalcInverseNextValue));
  const SetInverse open{"open", {"Any", "{a}"}, 1, "Any"}, tellsNothing{"open", {"Any", "{a}"}, 0, "{a}"};
  Check(open, ZOR_TYPED(CalcInverseNextValue));
  Check(tellsNothing, ZOR_ENTRY(CalcInverseNextValue));
}

}  // namespace
}  // namespace zor::test
