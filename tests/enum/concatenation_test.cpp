// Concatenation of sets of texts, and the operations that tell a set nothing.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

// clang-format off
const SetsRow kSums[] = {  // why, {z, x, y}, answer, z afterwards
  {"all pairs",                             {"Any", "{a,b}", "{c,d}"},               1, "{ac,ad,bc,bd}"},
  {"met with what z holds",                 {"{ad,x}", "{a,b}", "{c,d}"},            1, "{ad}"},
  {"nothing lost",                          {"{ac,ad,bc,bd}", "{a,b}", "{c,d}"},     0, "{ac,ad,bc,bd}"},
  {"nothing in common",                     {"{x}", "{a,b}", "{c,d}"},               1, "Nil"},
  {"one text of two pairs",                 {"Any", "{a,aa}", "{a,aa}"},             1, "{aa,aaa,aaaa}"},
  {"min is the empty text",                 {"Any", "{a}", "Min"},                   1, "{a}"},
  {"the greatest decides",                  {"{a}", "Max", "{b}"},                   1, "Max"},
  {"beside an open operand it does not",    {"{a}", "Max", "Any"},                   0, "{a}"},
  {"beside nil neither",                    {"{a}", "Max", "Nil"},                   1, "Nil"},
  {"a max beside texts takes no part",      {"Any", "{a,Max}", "{b}"},               1, "{ab}"},
  {"the target's max stays",                {"{ab,c,Max}", "{a}", "{b}"},            1, "{ab,Max}"},
  {"a full target lists nothing",           {"Max", "{z}", "{z}"},                   1, "Nil"},
  {"no limit of length",                    {"Any", "{a*200}", "{b*200}"},           1, "{a*200b*200}"},
};
const SetsInverse kHead[] = {  // why, {z, x, y}, answer, x afterwards
  {"a contradiction passes on",             {"Nil", "{a}", "Any"},                   1, "Nil"},
  {"nothing else does",                     {"{ab}", "{x}", "Nil"},                  0, "{x}"},
};
const Row<2, Set, Set, Set> kTail[] = {
  {"a contradiction passes on",             {"Nil", "Any", "{a}"},                   1, "Nil"},
  {"nothing else does",                     {"Max", "{x}", "{a}"},                   0, "{a}"},
};
const SetsInverse kTypedHead[] = {{"typed forms tell nothing", {"Nil", "{a}", "{b}"}, 0, "{a}"}};
const Row<0, Set, Set, Str> kSingleOperand[] = {
  {"no form for a single operand",          {"Any", "{a}", Text("b")},               0, "Any"},
  {"also of a nil one",                     {"{a}", "{a}", kNil},                    0, "{a}"},
};
// clang-format on

TEST(EnumConcatenation, Forward) {
  CheckRows(kSums, ZOR_OPERATION(CalcConcatenation));
  CheckRows(kSingleOperand, ZOR_ENTRY(CalcConcatenation));
}

TEST(EnumConcatenation, Inverse) {
  CheckRows(kHead, ZOR_ENTRY(CalcFirstInverseConcatenation));
  CheckRows(kTail, ZOR_ENTRY(CalcSecondInverseConcatenation));
  CheckRows(kTypedHead, ZOR_TYPED(CalcFirstInverseConcatenation));
  CheckRows(kTypedHead, ZOR_TYPED(CalcSecondInverseConcatenation));
  CheckRows(kSingleOperand, ZOR_ENTRY(CalcFirstInverseConcatenation));
  CheckRows(kSingleOperand, ZOR_ENTRY(CalcSecondInverseConcatenation));
}

// The first count texts of nothing but b.
Set Runs(int count) {
  Set runs{kExact, {}};
  for (int i = 0; i < count; ++i) runs.texts.push_back(std::string(i, 'b'));
  return runs;
}

TEST(EnumConcatenation, Limit) {
  Set sums{kExact, {}};
  const Set x = Many(16), y = Many(16, "b");
  for (const std::string& head : x.texts)
    for (const std::string& tail : y.texts) sums.texts.push_back(head + tail);
  sums.Sort();
  const SetsRow rows[] = {
      {"256 texts of 256 pairs", {"Any", x, y}, 1, sums},
      {"nothing lost of them", {sums, x, y}, 0, sums},
      {"257 texts", {"{q}", x, Many(17, "b")}, 0, "{q}"},
      {"a text that repeats below the limit counts once", {"Any", "{,b}", Runs(255)}, 1, Runs(256)},
      {"beside 256 it is one too many", {"{q}", "{,}", Runs(256)}, 0, "{q}"},
  };
  CheckRows(rows, ZOR_OPERATION(CalcConcatenation));
}

// Neither form of these tells anything, whatever the operands.
TEST(EnumConcatenation, NothingElse) {
  for (const char* known : {"{ab}", "Nil", "Any"}) {
    HeldSet z(known), x("{a,b}");
    HeldInteger start(Number(0)), end(kAnyNumber);
    for (ZORVaDoString* operand : {&x.Abstract(), &Missing<ZORVaDoString>()}) {
      const ZORVaDoString& told = z.value;
      EXPECT_EQ(z.Abstract().CalcSubString(*operand, start.value, end.value), 0);
      EXPECT_EQ(told.CalcFirstInverseSubString(*operand, start.value, end.value), 0);
      EXPECT_EQ(told.CalcSecondInverseSubString(*operand, start.value, end.value), 0);
      EXPECT_EQ(told.CalcThirdInverseSubString(*operand, start.value, end.value), 0);
      EXPECT_EQ(z.Abstract().CalcStringRepresentation(*operand), 0);
      EXPECT_EQ(told.CalcInverseStringRepresentation(*operand), 0);
    }
    EXPECT_EQ(z.value.CalcSubString(x.value, start.value, end.value), 0);
    EXPECT_EQ(z.value.CalcFirstInverseSubString(x.value, start.value, end.value), 0);
    EXPECT_EQ(z.value.CalcSecondInverseSubString(x.value, start.value, end.value), 0);
    EXPECT_EQ(z.value.CalcThirdInverseSubString(x.value, start.value, end.value), 0);
    EXPECT_TRUE(z.Now() == known && x.Now() == "{a,b}" && start.Now() == Number(0) && end.Now() == kAnyNumber);
  }
}

}  // namespace
}  // namespace zor::test
