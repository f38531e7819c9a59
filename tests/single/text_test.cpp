// Text and stream forms of single strings.
#include <gtest/gtest.h>

#include <climits>
#include <memory>
#include <random>

#include "tests/single/model.h"

using namespace zor::test;

// One value after the other from texts of the characters that matter and from any bytes at all, beside the model.
TEST(SingleText, InputOfAnyBytes) {
  constexpr char kCharacters[] = "MMNAinaxyl\"\"\"\" \n\0\xff{,}12";
  std::mt19937 random(20);
  // clang-format off
  std::vector<std::string> texts = {
      "Minimum", "Any\n\"a\"", "Nil", "Ma\nx", "max", " \t\n\v\f\rMax", "\"a\nc\"d", "\" \"",
      '"' + std::string(254, 'q') + '"', '"' + std::string(255, 'q') + '"'};
  // clang-format on
  for (int round = 0; round < 3000; ++round) {
    std::string text(1 + random() % 20, ' ');
    for (char& c : text) c = round % 7 == 0 ? static_cast<char>(random()) : kCharacters[random() % sizeof kCharacters];
    if (round % 10 == 0) text.insert(text.size() / 2, random() % 300, 'x');
    texts.push_back(text);
  }
  for (const std::string& text : texts) {
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

// A value that is filled from a stream keeps its text where none was stored; a new one has none.
TEST(SingleText, Forms) {
  const std::pair<Str, std::string> forms[] = {
      {"Nil", "Nil"}, {"Any", "Any"},   {"Min", "Min"},       {"Max", "Max"},
      {"", "\"\""},   {"ab", "\"ab\""}, {"a\"b", "\"a\"b\""}, {"z*255", '"' + std::string(255, 'z') + '"'}};
  for (const auto& [value, printed] : forms) {
    HeldSingle held(value), filled("old");
    std::ostringstream shown;
    shown << held.value;
    EXPECT_EQ(shown.str(), printed);
    ZORopstream out;
    ZORVadSingleString::writeRef(out, held.value);
    ZORVadSingleString::writePtr(out, &held.value);
    ZORipstream in(out.Bytes());
    ZORVadSingleString* made;
    ZORVadSingleString::readPtr(ZORVadSingleString::readRef(in, filled.value), made);
    ASSERT_NE(made, nullptr);
    const std::unique_ptr<ZORVadSingleString> owned(made);
    const bool hasText = value.tag == kExact || value.tag == kMaxTag;
    EXPECT_EQ(filled.Now(), Str(value.tag, hasText ? value.text : "old"));
    EXPECT_EQ(Of(*made), Str(value.tag, hasText ? value.text : ""));
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
    HeldSingle held("old");
    held.value.Read(in);
    EXPECT_EQ(held.Now(), kNil) << testing::PrintToString(bytes);
  }
}

TEST(SingleText, OfOtherClasses) {
  HeldSingle text(kAny);
  ZORVadSingleInteger read;
  EXPECT_EQ(text.value.CalcStringRepresentation(ZORVadSingleInteger(7)), 1);
  EXPECT_EQ(text.Now(), Str("7"));
  EXPECT_EQ(text.value.CalcInverseStringRepresentation(read), 1);
  EXPECT_EQ(read.GetValue(), 7);
}
