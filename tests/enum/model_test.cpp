// Every operation on every combination of values, beside the model.
#include <gtest/gtest.h>

#include <climits>

#include "tests/enum/rows.h"

namespace zor::test {
namespace {

const std::vector<Value> kSets = ListOf<Set>(
    {"Nil",     "Any",     "Max",       "Min",         "{ }",         "{a}",         "{b}",     "{a,b}",
     "{,a}",    "{a,Max}", "{,Max}",    "{b,Max}",     "{z*255}",     "{z*255,Max}", "{z*256}", "{a,a}",
     "Any{a}",  "{aa,ab}", "{a,b,c}",   "{A,b}",       "{a*255}",     "{c,d}",       "Nil{b}",  "{,}",
     "{A}",     "{B,a}",   "{A,B}",     "{A,a}",       "{A,a,b,Max}", "{ab ,ac}",    "{z*254}", "{z*254,z*255}",
     "{a*254}", "{a*256}", "{a*253zz}", "{z*256,Max}", "{a,a,b}",     "{m,z}",       "{ ,!}",   "Any{a,b}"});
const std::vector<Value> kTripled(kSets.begin(), kSets.begin() + 18);
const std::vector<Value> kFew(kSets.begin(), kSets.begin() + 6);
const std::vector<Value> kSingles = ListOf<Str>({"Nil", Str(kNilTag, "a"), "Any", Str(kAnyTag, "b"), "Max", "Min", "",
                                                 "a", "A", "b", "c", "z*255", "z*256", "z*254y", "a*255"});
const std::vector<Value> kNumbers = ListOf<Int>({Int(kNilTag), Int(), -1, 0, 1, 2, 254, 255, 256, INT_MAX, INT_MIN});
const std::vector<Value> kWords =
    ListOf<Word>({"", " ", "!", "A", "a", "aa", "ab", "b", "c", "bb", "z", "~", "z*254", "z*255", "z*256", "a*255"});

const std::vector<Value>& ListFor(const Row& row, std::size_t operand) {
  const std::vector<Value>* const lists[] = {&kSingles,
                                             row.kinds.size() == 4   ? &kFew
                                             : row.kinds.size() == 3 ? &kTripled
                                                                     : &kSets,
                                             &kNumbers, &kWords};
  return *lists[row.kinds[operand]];
}

TEST(EnumModel, EveryCombination) {
  for (const Row& row : SetRows()) {
    std::vector<std::vector<Value>> lists;
    for (std::size_t i = 0; i < row.kinds.size(); ++i) lists.push_back(ListFor(row, i));
    EXPECT_EQ(CompareAll(row, lists), "");
  }
}

// Texts that are those of the value itself.
TEST(EnumModel, ListedTexts) {
  for (const Row& row : SetRows()) {
    if (row.kinds.back() != Value(Word()).index()) continue;
    for (const Value& z : kSets) {
      const auto& texts = std::get<Set>(z).texts;
      for (std::size_t i = 0; i < texts.size(); ++i)
        EXPECT_EQ(CallTwice(row, {z, Word{texts[i]}}, {0, 1}, static_cast<int>(i)), "");
    }
  }
}

// The first count texts of nothing but b.
Set Runs(int count) {
  Set runs{kExact, {}};
  for (int i = 0; i < count; ++i) runs.texts.push_back(std::string(i, 'b'));
  return runs;
}

// Around 256 texts, where operations that build texts give up.
TEST(EnumModel, ManyTexts) {
  Set folding{kExact, {}};  // 320 texts of five letters in either case, whose folds are ten
  for (int i = 0; i < 320; ++i) {
    std::string text = "abcde" + std::to_string(i / 32);
    for (int letter = 0; letter < 5; ++letter) text[letter] ^= (i >> letter & 1) * 0x20;
    folding.texts.push_back(text);
  }
  folding.Sort();
  const auto many = ListOf<Set>(
      {"Any", "{1,99}", "{a,a1,a99,a990,b}", Many(255), Many(256), Many(256, "A"), Many(257), Many(300), folding});
  const auto targets = ListOf<Set>({"Any", "{q}", Many(300), Many(256, "a0b")}),
             heads = ListOf<Set>({Many(16), "{,b}", "{,}", "{a}"}),
             tails = ListOf<Set>({Many(16, "b"), Many(17, "b"), Runs(255), Runs(256), "{1,99}"});
  for (const Row& row : SetRows()) {
    const std::size_t last = row.kinds.back();
    if (row.kinds.size() == 4) continue;
    if (row.kinds.size() == 3) {
      EXPECT_EQ(CompareAll(row, {targets, heads, tails}), "");
    } else {
      EXPECT_EQ(CompareAll(row, {many, last == 1 ? many : last == 0 ? kSingles : last == 2 ? kNumbers : kWords}), "");
    }
  }
}

TEST(EnumModel, WrongOperands) {
  ZORVadSingleString single("b");
  ZORVadSingleInteger number(7);
  for (const char* z : {"{a,b}", "Nil", "Any", "Min", "{b,Max}"}) {
    EXPECT_EQ(CheckWrongOperand(Set(z), Set("{b}"), nullptr, true, 2), "") << z;
    EXPECT_EQ(CheckWrongOperand(Set(z), Set("{b}"), &single, true, 3), "") << z;
    EXPECT_EQ(CheckWrongOperand(Set(z), Set("{b}"), &number, false, 2), "") << z;
  }
  EXPECT_EQ(Of(single), Str("b"));
}

// A bare vector, whose texts are copied.
TEST(EnumModel, Vectors) {
  for (const Value& z : kSets) {
    for (const Value& x : kSets) {
      ZORISVectorImp_String texts(20, 20u);
      for (const std::string& text : std::get<Set>(x).texts) texts.Add(new ZORString(text));
      for (const bool intersects : {false, true}) {
        HeldSet held(std::get<Set>(z));
        Set expected = std::get<Set>(z);
        for (int call = 1; call <= 2; ++call) {
          const auto& listed = std::get<Set>(x).texts;
          const int answer =
              intersects ? model::IntersectTexts(expected, listed) : model::AppendTexts(expected, listed);
          ASSERT_EQ(intersects ? held.value.Intersect(texts) : held.value.Append(texts), answer) << z << ' ' << x;
          ASSERT_EQ(held.Now(), expected) << z << ' ' << x;
        }
      }
      ASSERT_EQ(texts.Count(), std::get<Set>(x).texts.size());
      texts.Flush(1);
    }
  }
}

// The states, bounds and neighbours that a value tells, and the operations that look at nothing else.
TEST(EnumModel, States) {
  for (const Value& any : kSets) {
    const Set& z = std::get<Set>(any);
    const bool nil = model::IsNil(z), open = model::IsAny(z), min = model::IsMin(z), max = model::IsMax(z);
    const HeldSet told(z);
    const ZORVaDoString& value = told.value;
    EXPECT_EQ(std::tuple(value.IsNil(), value.IsUndefined(), value.IsEmpty(), value.IsFull(), told.value.CheckNil(),
                         told.value.CheckAny()),
              std::tuple(nil, open, min, max, nil, open))
        << z;
    EXPECT_EQ(value.GetCardinality(), nil ? 0 : open ? 256 : z.texts.size()) << z;
    EXPECT_EQ(Plain(value.GetLowerBound()), model::Lower(z)) << z;
    EXPECT_EQ(Plain(value.GetUpperBound()), model::Upper(z)) << z;
    const struct {
      int answer;
      Set after;
      int (*call)(ZORVaDoString& v);
    } changes[] = {{!min, "Min", [](ZORVaDoString& v) { return v.CalcMinValue(); }},
                   {!min, "Min", [](ZORVaDoString& v) { return v.CalcEmptyValue(); }},
                   {!max, "Max", [](ZORVaDoString& v) { return v.CalcMaxValue(); }},
                   {!max, "Max", [](ZORVaDoString& v) { return v.CalcFullValue(); }},
                   {0, "Nil", [](ZORVaDoString& v) { return v.SetNilValue(), 0; }},
                   {0, "Any", [](ZORVaDoString& v) { return v.SetUndefinedValue(), 0; }},
                   {!nil, nil ? z : "Nil", [](ZORVaDoString& v) { return v.Nil(); }},
                   {!open, open ? z : "Any", [](ZORVaDoString& v) { return v.Any(); }}};
    for (const auto& [answer, after, call] : changes) {
      HeldSet held(z);
      EXPECT_EQ(call(held.value), answer) << z;
      EXPECT_EQ(held.Now(), after) << z;
    }
  }
}

TEST(EnumModel, Neighbours) {
  for (const Value& any : kSets) {
    const Set& z = std::get<Set>(any);
    const HeldSet held(z);
    for (const Value& word : kWords) {
      const std::string& text = std::get<Word>(word).text;
      const ZORString given(text);
      EXPECT_EQ(Plain(held.value.GetNextExactValue(given)), model::NextExactValue(z, text)) << z << text;
      EXPECT_EQ(Plain(held.value.GetPrevExactValue(given)), model::PrevExactValue(z, text)) << z << text;
      const int position = held.value.Contains(given), first = model::Contains(z, text);
      EXPECT_EQ(position > 0 ? 1 : position, first > 0 ? 1 : first);  // of equal texts it may be any
      EXPECT_TRUE(position <= 0 || z.texts[position - 1] == text);
      EXPECT_EQ(held.value.Contains(&given), position);
    }
  }
}

}  // namespace
}  // namespace zor::test
