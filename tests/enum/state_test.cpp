// Construction, copies and membership of sets of texts.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

TEST(EnumState, Construction) {
  const ZORVadEnumString fresh;
  EXPECT_EQ(Of(fresh), Set("Any"));
  EXPECT_TRUE(fresh.GetCardinality() == 256 && fresh.Contains("") == 0);
  EXPECT_EQ(Of(ZORVadEnumString(ZORString("ab"))), Set("{ab}"));
  EXPECT_EQ(Of(ZORVadEnumString(static_cast<const void*>("ab"))), Set("{ab}"));
  EXPECT_EQ(Of(ZORVadEnumString(HeldSet("{a,b,Max}").value)), Set("{a,b,Max}"));
  EXPECT_EQ(Of(ZORVadEnumString(HeldSet("Any{a,a}").value)), Set("Any{a,a}"));
  EXPECT_EQ(Of(ZORVadEnumString(HeldSet("{a,a}").value)), Set("{a}")) << "a copy lists each text once";
  for (const auto& [single, set] : std::initializer_list<std::pair<Str, Set>>{
           {Text("abc"), "{abc}"}, {kMin, "{ }"}, {kMax, "Max"}, {{kAnyTag, "a"}, "Any"}, {{kNilTag, "a"}, "Nil"}}) {
    EXPECT_EQ(Of(ZORVadEnumString(HeldSingle(single).value)), set);
  }
}

// Assigning a value to itself changes nothing, in any form.
TEST(EnumState, SelfAssignment) {
  for (const char* notation : {"{a,b,Max}", "{a,a}", "Max", "Nil", "Any{a}"}) {
    HeldSet held(notation);
    const auto objects = held.Objects();
    const auto& same = held.value;
    held.value = same;
    held.value.Assign(same);
    held.value.Copy(same);
    held.Abstract().Assign(same);
    EXPECT_EQ(held.Now(), Set(notation));
    EXPECT_EQ(held.Objects(), objects);
  }
}

// What one value does never shows in another.
TEST(EnumState, CopiesShareNothing) {
  HeldSet original("{a,b,c}"), assigned("{x}");
  ZORVadEnumString copy(original.value);
  assigned.value = copy;
  copy.GetValue(1) = "bb";
  EXPECT_EQ(Of(copy), Set("{a,bb,c}"));
  copy.CutUpper("a");
  original.value.SetUpperBound("aa");
  EXPECT_EQ(original.Now(), Set("{a,aa}"));
  EXPECT_EQ(assigned.Now(), Set("{a,b,c}"));
}

// Around the sizes at which the places grow.
TEST(EnumState, Sizes) {
  for (int count = 1; count <= 64; ++count) {
    HeldSet held(Many(count)), merged("{b}");
    EXPECT_EQ(Of(ZORVadEnumString(held.value)), Many(count));
    EXPECT_EQ(merged.value.Append(held.value), 1);
    EXPECT_EQ(merged.value.Count(), count + 1);
  }
}

// clang-format off
const SetRow kAppend[] = {  // why, {z, x}, answer, z afterwards, second answer
  {"a text that is there",        {"{a,b}", "{b,c}"}, 0, "{a,b,c}", 0},
  {"all are new",                 {"{b}", "{a,c}"},   1, "{a,b,c}", 0},
  {"no text, whatever the state", {"{a}", "Max"},     0, "{a}", 0},
  {"a full value lists",          {"Max", "{a}"},     1, "{a,Max}", 0},
};
const SetRow kCopy[] = {
  {"texts",                       {"{z,Max}", "{a}"}, 1, "{a}", 1},
  {"a full value brings none",    {"{a}", "Max"},     0, "Max", 0},
};
// clang-format on

TEST(EnumState, Append) {
  CheckRows(kAppend, ZOR_TYPED(Append));
  CheckRows(kCopy, ZOR_TYPED(Copy));
  HeldSet held("{a}");
  EXPECT_EQ(held.value.Append(ZORISVectorImp_String()), 1) << "an empty vector";
  EXPECT_EQ(HeldSet("Max").value.Assign(HeldSet("Max").value), 1);
}

// clang-format off
const TextRow kContains[] = {  // why, z, text, answer, z afterwards
  {"the position, from 1",                "{a,b}",   "b",     2,  "{a,b}"},
  {"none",                                "{a,c}",   "b",     0,  "{a,c}"},
  {"a full value",                        "Max",     "b",     -1, "Max"},
  {"the greatest is held by the state",   "{a,Max}", "z*255", 0,  "{a,Max}"},
  {"no test of an open value's texts",    "Any{a}",  "a",     0,  "Any{a}"},
};
const TextRow kInsert[] = {
  {"in order",                            "{a,c}",   "b",     1,  "{a,b,c}"},
  {"listed",                              "{a,c}",   "c",     0,  "{a,c}"},
  {"min is no longer",                    "Min",     "a",     1,  "{,a}"},
  {"full no longer, the max stays",       "Max",     "a",     1,  "{a,Max}"},
};
const TextRow kCutLower[] = {
  {"the bound stays",                     "{a,b,c}", "b",     2,  "{b,c}"},
  {"it is not added",                     "{a,c}",   "b",     1,  "{c}"},
  {"above all texts",                     "{a,c}",   "d",     0,  "Nil"},
  {"the max remains",                     "{a,Max}", "d",     0,  "Max"},
};
const TextRow kCutUpper[] = {
  {"the bound stays",                     "{a,b,c}", "b",     2,  "{a,b}"},
  {"it is not added",                     "{a,b,c}", "bb",    2,  "{a,b}"},
  {"the max goes",                        "{b,d,Max}", "c",   1,  "{b}"},
  {"but for the greatest bound",          "{a,Max}", "z*255", 1,  "{a,Max}"},
  {"below all texts",                     "{b}",     "a",     0,  "Nil"},
};
// clang-format on

TEST(EnumState, Membership) {
  CheckTexts(kContains, ZOR_OPERATION(Contains));
  CheckTexts(kInsert, ZOR_OPERATION(Insert));
  CheckTexts(kCutLower, ZOR_OPERATION(CutLower));
  CheckTexts(kCutUpper, ZOR_OPERATION(CutUpper));
}

}  // namespace
}  // namespace zor::test
