// Text and stream forms of single strings.
#include <memory>
#include <random>

#include "tests/single/model.h"
#include "tests/support/check.h"

using namespace zor::test;

// clang-format off
static const std::string k254(254, 'q');
static const struct {
  const char* why;
  std::string text;
  Str value;
  std::size_t left;
} kInputs[] = {
  {"three letters of a word",          "Minimum",                    kMin,           4},
  {"the end of its line goes too",     "Any\n\"a\"",                 kAny,           3},
  {"nil is no word",                   "Nil",                        kNil,           0},
  {"a word is not broken",             "Ma\nx",                      kNil,           1},
  {"case matters, nothing is taken",   "max",                        kNil,           3},
  {"blanks come first",                " \t\n\v\f\rMax",             kMax,           0},
  {"a text",                           "\"a\nc\"d",                  Text("a\nc"),   1},
  {"a space is min",                   "\" \"",                      kMin,           0},
  {"the longest text",                 '"' + k254 + '"',             Text(k254),     0},
};
static const struct {
  Str value;
  std::string printed;
  bool comes;  // back as it was printed
} kForms[] = {
  {kNil,            "Nil",     true},  {kAny,            "Any",                             true},
  {kMin,            "Min",     true},  {kMax,            "Max",                             true},
  {Text(""),        "\"\"",    true},  {Text("ab"),      "\"ab\"",                          true},
  {Text("a\"b"),    "\"a\"b\"", false}, {Times(255, 'z'), '"' + std::string(255, 'z') + '"', false},
};
// clang-format on

static std::size_t Input(HeldSingle& held, std::string_view text) {
  ZORistrstream in(text.data(), static_cast<int>(text.size()));
  held.value.InputValue(in);
  return in.Left();
}

TEST(SingleText, Input) {
  for (const auto& [why, text, value, left] : kInputs) {
    HeldSingle held(Text("old"));
    EXPECT_EQ(Input(held, text), left) << why;
    EXPECT_EQ(held.Now(), value) << why;
  }
}

// One value after the other from texts of the characters that matter and from any bytes at all.
TEST(SingleText, InputOfAnyBytes) {
  constexpr char kCharacters[] = "MMNAinaxyl\"\"\"\" \n\0\xff{,}12";
  std::mt19937 random(20);
  for (int round = 0; round < 3000; ++round) {
    std::string text(1 + random() % 20, ' ');
    for (char& c : text) c = round % 7 == 0 ? static_cast<char>(random()) : kCharacters[random() % sizeof kCharacters];
    if (round % 10 == 0) text.insert(text.size() / 2, random() % 300, 'x');
    std::string_view rest = text;
    ZORistrstream in(text.data(), static_cast<int>(text.size()));
    HeldSingle held(kAny);
    for (int call = 0; call < 8; ++call) {
      held.value.InputValue(in);
      ASSERT_EQ(held.Now(), model::Input(rest)) << testing::PrintToString(text) << " call " << call;
      ASSERT_EQ(in.Left(), rest.size()) << testing::PrintToString(text) << " call " << call;
    }
  }
}

TEST(SingleText, PrintAndInput) {
  for (const auto& [value, printed, comes] : kForms) {
    HeldSingle held(value), input(Text("old"));
    ZORostrstream out;
    held.value.PrintOn(out);
    EXPECT_EQ(out.View(), printed);
    Input(input, printed);
    EXPECT_EQ(input.Now() == value, comes) << value;
  }
}

// A value that is filled keeps its text where none was stored; a new one has none.
TEST(SingleText, WriteAndRead) {
  for (const auto& form : kForms) {
    const Str& value = form.value;
    HeldSingle held(value), filled(Text("old"));
    ZORopstream out;
    ZORVadSingleString::writeRef(out, held.value);
    ZORVadSingleString::writePtr(out, &held.value);
    ZORipstream in(out.Bytes());
    ZORVadSingleString* made;
    ZORVadSingleString::readPtr(ZORVadSingleString::readRef(in, filled.value), made);
    ASSERT_NE(made, nullptr);
    const std::unique_ptr<ZORVadSingleString> owned(made);
    const bool hasText = value.tag == kExact || value.tag == kMaxTag;
    EXPECT_EQ(filled.Now(), (Str{value.tag, hasText ? value.text : "old"}));
    EXPECT_EQ((Str{made->GetState(), Plain(made->GetLowerBound())}), (Str{value.tag, hasText ? value.text : ""}));
  }
}

TEST(SingleText, BrokenStreams) {
  ZORopstream whole;
  ZORVadSingleString("ab").Write(whole);
  std::vector<std::string> broken;
  for (std::size_t size = 0; size < whole.Bytes().size(); ++size) broken.push_back(whole.Bytes().substr(0, size));
  for (const ZORLong noState : {-1, 4, INT_MAX}) {
    ZORopstream out;
    broken.push_back((out << noState).Bytes() + whole.Bytes());
  }
  for (const std::string& bytes : broken) {
    ZORipstream in(bytes);
    HeldSingle held(Text("old"));
    held.value.Read(in);
    EXPECT_EQ(held.Now(), kNil) << testing::PrintToString(bytes);
  }
}

TEST(SingleText, Representation) {
  HeldSingle text(kAny);
  HeldInteger seven(Number(7)), read(kAnyNumber);
  EXPECT_EQ(text.value.CalcStringRepresentation(seven.value), 1);
  EXPECT_EQ(text.Now(), Text("7"));
  EXPECT_EQ(text.value.CalcInverseStringRepresentation(read.value), 1);
  EXPECT_EQ(read.Now(), Number(7));
}
