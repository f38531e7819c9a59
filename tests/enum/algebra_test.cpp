// Set operations: intersection and equality, union, common texts, bisection.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

// clang-format off
const SetRow kIntersect[] = {  // why, {z, x}, answer, z afterwards
  {"what both list",                         {"{a,b,c}", "{b,c,d}"},     1, "{b,c}"},
  {"nothing lost",                           {"{a,b}", "{a,b}"},         0, "{a,b}"},
  {"nothing in common",                      {"{a,b}", "{c}"},           1, "Nil"},
  {"with its max",                           {"Any", "{a,Max}"},         1, "{a,Max}"},
  {"an open operand tells nothing",          {"{a}", "Any"},             0, "{a}"},
  {"full and a max beside texts",            {"Max", "{a,Max}"},         0, "Max"},
  {"full and no max",                        {"Max", "{a}"},             1, "Nil"},
  {"the target's max stays",                 {"{a,b,Max}", "{a,b}"},     0, "{a,b,Max}"},
  {"two max meet in no text",                {"{a,Max}", "{b,Max}"},     1, "Nil"},
  {"nor beside a full operand",              {"{a,Max}", "Max"},         1, "Nil"},
  {"the operand's max takes no part",        {"{a,b}", "{a,Max}"},       1, "{a}"},
  {"of equal texts one stays",               {"{a,a,b}", "{a,b}"},       1, "{a,b}"},
};
const SingleRow kIntersectSingle[] = {
  {"1 also when it stands alone",            {"{a}", Text("a")},         1, "{a}", 1},
  {"the text alone stays",                   {"{a,b,Max}", Text("b")},   1, "{b}", 1},
  {"another",                                {"{a}", Text("b")},         1, "Nil", 0},
  {"the greatest tells nothing",             {"{a,b}", kMax},            0, "{a,b}", 0},
  {"nor to the greatest",                    {"Max", kMax},              0, "Max", 0},
  {"one space is no empty text",             {"Min", kMin},              1, "Nil", 0},
  {"an open target",                         {"Any", Text("a")},         1, "{a}", 1},
};
const SingleInverse kIntersectInverse[] = {  // why, {z, x}, answer, x afterwards
  {"one text is taken",                      {"{x}", kAny},              1, Text("x")},
  {"also beside a max",                      {"{x,Max}", kAny},          1, Text("x")},
  {"two are not",                            {"{x,y}", kAny},            0, kAny},
  {"which holds any text",                   {"Max", Text("a")},         0, Text("a")},
  {"a listed text",                          {"{x,y}", Text("y")},       0, Text("y")},
  {"another",                                {"{x,y}", Text("z")},       1, kNil},
};
const SetRow kUnite[] = {  // why, {z, x}, 0, z afterwards
  {"all texts",                              {"{b}", "{a,b,c}"},         0, "{a,b,c}"},
  {"nil takes a copy",                       {"Nil", "{a,Max}"},         0, "{a,Max}"},
  {"nil adds nothing",                       {"{a}", "Nil"},             0, "{a}"},
  {"a max beside texts is not taken",        {"{a}", "{b,Max}"},         0, "{a,b}"},
  {"nor a full operand",                     {"{a}", "Max"},             0, "{a}"},
  {"a full target keeps its max",            {"Max", "{a}"},             0, "{a,Max}"},
};
const SingleRow kUniteSingle[] = {
  {"a text",                                 {"{b}", Text("a")},         0, "{a,b}"},
  {"the greatest comes as a text",           {"{a}", kMax},              0, "{a,z*255}"},
};
const SetRow kIsIntersected[] = {
  {"a common text",                          {"{a,b}", "{b,c}"},         1, "{a,b}", 1},
  {"none",                                   {"{a}", "{b}"},             0, "{a}", 0},
  {"two max beside texts are none",          {"{a,Max}", "{b,Max}"},     0, "{a,Max}", 0},
  {"the greatest and a max",                 {"Max", "{b,Max}"},         1, "Max", 1},
  {"not the other way",                      {"{b,Max}", "Max"},         0, "{b,Max}", 0},
  {"nil before open",                        {"Any", "Nil"},             0, "Any", 0},
};
// clang-format on

TEST(EnumAlgebra, Intersect) {
  CheckRows(kIntersect, ZOR_TYPED(Intersect));
  CheckRows(kIntersect, ZOR_OPERATION(CalcEqualValue));
  CheckRows(kIntersectSingle, ZOR_OPERATION(CalcEqualValue));
  CheckRows(kIntersectInverse, ZOR_OPERATION(CalcInverseEqualValue));
}

TEST(EnumAlgebra, Unite) {
  const auto unite = [](auto& z, auto& x) { return z.Unite(x), 0; };
  CheckRows(kUnite, unite);
  CheckRows(kUniteSingle, unite);
  HeldSet large(Many(200));
  large.value.Unite(HeldSet(Many(200, "b")).value);
  EXPECT_EQ(large.value.Count(), 400);
}

TEST(EnumAlgebra, IsIntersected) { CheckRows(kIsIntersected, ZOR_OPERATION(IsIntersected)); }

TEST(EnumAlgebra, Bisect) {
  for (const int selection : {-1, 0, 1, 2, 3, 4}) {
    for (const char* z : {"{a,b}", "Any", "Nil", "Max"}) {
      HeldSet whole(z), alone(z), rest("{c}");
      HeldSingle single(Text("c"));
      const auto selected = static_cast<ZORVaDoAny::ValueSelection>(selection);
      whole.Abstract().Bisect(rest.value, selected);
      alone.Abstract().Bisect(single.value, selected);
      EXPECT_EQ(whole.Now(), selection >= 0 && selection <= 3 ? Set(z) : Set("Nil")) << z << selection;
      EXPECT_EQ(alone.Now(), Set("Nil")) << z << selection;
      whole.Abstract().Bisect(Missing<ZORVaDoObject>(), selected);
      EXPECT_EQ(whole.Now(), Set("Nil")) << z << selection;
      EXPECT_TRUE(rest.Now() == "{c}" && single.Now() == Text("c"));
    }
  }
}

}  // namespace
}  // namespace zor::test
