// Text and stream forms of sets of texts.
#include <gtest/gtest.h>

#include <climits>

#include "tests/support/values.h"

namespace zor::test {
namespace {

// What a stream holds is read into v; what it leaves is answered.
std::size_t Input(ZORVaDoObject& v, std::string_view text) {
  ZORistrstream in(text.data(), static_cast<int>(text.size()));
  v.InputValue(in);
  return in.Left();
}

const std::string k254(254, 'q');

// clang-format off
const struct {
  const char* why;
  std::string text;
  Set value;
  std::size_t left;
} kInputs[] = {
  {"a text",                             R"("abc")",                "{abc}",     0},
  {"the empty text is min",              R"("")",                   "Min",       0},
  {"one space is not",                   R"(" ")",                  "{ }",       0},
  {"a text without its end",             R"("ab)",                  "{ab}",      0},
  {"no text after the brace",            "{",                       "Nil",       0},
  {"nor behind the quote",               R"({ "a", ")",             "Nil",       0},
  {"in any order",                       R"({ "b", "a" })",         "{a,b}",     0},
  {"without blanks",                     R"({"a","b"}x)",           "{a,b}",     1},
  {"equal texts stay",                   R"({ "a", "b", "a" })",    "{a,a,b}",   0},
  {"two empty texts are not min",        R"({ "", "" })",           "{,}",       0},
  {"no text in braces",                  "{ }",                     "Nil",       0},
  {"no comma",                           R"({ "a" "b" })",          "Nil",       4},
  {"no max in braces",                   R"({ "a", Max })",         "Nil",       4},
  {"no end",                             R"({ "a", "b")",           "Nil",       0},
  {"a comma too many",                   R"({ "a", })",             "Nil",       0},
  {"a word",                             "Maximum",                 "Max",       4},
  {"nil is no word",                     "Nil",                     "Nil",       0},
  {"case matters, nothing is taken",     "nil",                     "Nil",       3},
  {"nothing",                            "",                        "Nil",       0},
  {"a long text is cut",                 '"' + k254 + "r\"",        {kExact, {k254}}, 2},
  {"in braces the rest is no comma",     "{\"" + k254 + "r\"}",     "Nil",       2},
  {"of the limit it is whole",           "{\"" + k254 + "\"}",      {kExact, {k254}}, 0},
};

const struct {
  Set value;
  std::string printed;
  Set back;    // from the text form
  Set stored;  // from the stream form
} kForms[] = {
  {"Nil",         "Nil",                    "Nil",       "Nil"},
  {"Any",         "Any",                    "Any",       "Any"},
  {"Any{a}",      "Any",                    "Any",       "Any"},
  {"Min",         "Min",                    "Min",       "Min"},
  {"Max",         "Max",                    "Max",       "Max"},
  {"{ }",         R"(" ")",                 "{ }",       "{ }"},
  {"{a}",         R"("a")",                 "{a}",       "{a}"},
  {"{a,b,cd}",    R"({ "a", "b", "cd" })",  "{a,b,cd}",  "{a,b,cd}"},
  {"{a,a}",       R"({ "a", "a" })",        "{a,a}",     "{a,a}"},
  {"{,}",         R"({ "", "" })",          "{,}",       "{,}"},
  {"{a,Max}",     R"({ "a", Max })",        "Nil",       "Max"},
  {"{,Max}",      R"({ "", Max })",         "Nil",       "Max"},
  {"{a,b,Max}",   R"({ "a", "b", Max })",   "Nil",       "Max"},
  {"{a\"b}",      R"("a"b")",               "{a}",       "{a\"b}"},
  {{kExact, {k254 + "r"}}, '"' + k254 + "r\"", {kExact, {k254}}, {kExact, {k254 + "r"}}},
};
// clang-format on

TEST(EnumText, Input) {
  for (const auto& [why, text, value, left] : kInputs) {
    for (const char* before : {"Any", "Nil", "Min", "Max", "{x,y}", "{x,Max}"}) {
      HeldSet held(before);
      EXPECT_EQ(Input(held.Abstract(), text), left) << why;
      EXPECT_EQ(held.Now(), value) << why << ", over " << before;
    }
  }
}

std::string Printed(const ZORVadEnumString& v) {
  std::ostringstream out;
  out << v;
  return out.str();
}

std::string Stored(const ZORVadEnumString& v) {
  ZORopstream out;
  v.Write(out);
  return out.Bytes();
}

Set Read(ZORVadEnumString& v, std::string bytes, std::size_t left = 0) {
  ZORipstream in(std::move(bytes));
  static_cast<ZORVaDoObject&>(v).Read(in);
  EXPECT_EQ(in.Left(), left);
  return Of(v);
}

TEST(EnumText, BackAsItWent) {
  for (const auto& [value, printed, back, stored] : kForms) {
    HeldSet held(value), read("{x,Max}");
    EXPECT_EQ(Printed(held.value), printed);
    Input(read.Abstract(), printed);
    EXPECT_EQ(read.Now(), back);
    ZORVadEnumString fresh(ZorStreamableInit);
    EXPECT_EQ(Read(fresh, Stored(held.value)), stored);
    EXPECT_EQ(Read(read.value, Stored(held.value)), stored);
  }
  HeldSet many(Many(300)), read("Nil");
  Input(read.Abstract(), Printed(many.value));
  EXPECT_EQ(read.Now(), many.Now());
  EXPECT_EQ(Read(read.value, Stored(many.value)), many.Now());
}

// A tag, and for a set a count and texts, as a stream holds them.
std::string Bytes(std::initializer_list<ZORLong> numbers, std::initializer_list<const char*> texts = {}) {
  ZORopstream out;
  for (const ZORLong number : numbers) out << number;
  for (const char* text : texts) out.WriteString(text);
  return out.Bytes();
}

TEST(EnumText, StreamItems) {
  EXPECT_EQ(Stored(HeldSet("{a,b}").value), Bytes({0, 2}, {"a", "b"}));
  EXPECT_EQ(Stored(HeldSet("Any").value), Bytes({1}));
  EXPECT_EQ(Stored(HeldSet("Nil").value), Bytes({2}));
  EXPECT_EQ(Stored(HeldSet("{a,Max}").value), Bytes({3}));
}

TEST(EnumText, HostileStreams) {
  for (const char* before : {"Any", "{x,Max}", "{x}"}) {
    HeldSet held(before);
    EXPECT_EQ(Read(held.value, Bytes({0, 3}, {"b", "a", "b"})), Set("{a,b,b}")) << "in any order";
    EXPECT_EQ(Read(held.value, Bytes({0, 0})), Set("Nil"));
    EXPECT_EQ(Read(held.value, Bytes({0, -1}, {"a"}), Bytes({}, {"a"}).size()), Set("Nil"));
    EXPECT_EQ(Read(held.value, Bytes({0, INT32_MAX}, {"a", "b"})), Set("Nil"));
    for (const ZORLong tag : {-1, 4, INT32_MIN, INT32_MAX}) EXPECT_EQ(Read(held.value, Bytes({tag})), Set("Nil"));
    const std::string whole = Bytes({0, 2}, {"ab", "cd"});
    for (std::size_t size = 0; size < whole.size(); ++size) {
      ZORipstream in(whole.substr(0, size));
      held.Abstract().Read(in);
      EXPECT_EQ(held.Now(), Set("Nil")) << size;
    }
  }
}

}  // namespace
}  // namespace zor::test
