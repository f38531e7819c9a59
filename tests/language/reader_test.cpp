// What is told of broken models: place, caret, note.
#include "language/reader.h"

#include <fmt/core.h>
#include <gtest/gtest.h>

#include "tests/language/support.h"

namespace {

std::string Told(const std::string& model) {
  zornet::Source source("", model);
  zornet::Diagnostics diagnostics;
  zornet::Read(source, diagnostics);
  std::string text = zornet::Render(source, diagnostics, false);
  for (std::size_t at = 0; (at = text.find("\n:", at)) != std::string::npos;) text.erase(at + 1, 1);
  return text.empty() ? text : text.substr(1);
}

TEST(Reader, TellsWhatIsBroken) {
  for (const Row& row : Rows("broken.txt")) EXPECT_EQ(Told(row.model), row.expected) << row.why;
}

// What an editor would not keep in a file of rows.
TEST(Reader, TellsOfControlCharactersAndLineEnds) {
  EXPECT_EQ(Told("var string: x;\x1b\x9B% \xC2\x9B\x7F\n"),
            "1:15: error: character 27 has no meaning here\nvar string: x;??% ??\n              ^\n"
            "1:16: error: '?' has no meaning here\nvar string: x;??% ??\n               ^\n");
  EXPECT_EQ(Told("var string: x;\r\noutput y;\r\n"), "2:8: error: 'y' is not declared\noutput y;\n       ^\n");
  EXPECT_EQ(Told("constraint str_eq(\"a\","),
            "1:23: error: the model ends here, expected a text in quotes, an integer, true or false\n"
            "constraint str_eq(\"a\",\n                      ^\n");
}

TEST(Reader, LongestText) {
  const auto model = [](std::size_t length) { return "var string: x = \"" + std::string(length, 'a') + "\";"; };
  EXPECT_EQ(Told(model(255)), "");
  EXPECT_TRUE(Told(model(256)).starts_with("1:17: error: a text has at most 255 characters, this one has 256\n"));
}

TEST(Reader, StopsAfterTwentyErrors) {
  std::string model;
  for (int i = 0; i < 20; ++i) model += "nonsense;\n";
  const std::string all = Told(model), told = Told(model + "output x;");
  EXPECT_TRUE(all.ends_with(
      "20:1: error: expected 'var', 'set', 'array', 'constraint', 'output' or 'include'\nnonsense;\n^~~~~~~~\n"));
  EXPECT_EQ(told, all + " stopped after 20 errors\n");
}

// Each takes half a minute and more where work grows with the square of the model.
TEST(Reader, LongBrokenModels) {
  std::string names, uses, items = "x ";
  for (int i = 0; i < 3000; ++i) {
    names += fmt::format("var string: name{}; ", i);
    uses += fmt::format("constraint str_eq(\"\", nane{}); ", i);
    items += "var var var var var var var var ";
  }
  EXPECT_TRUE(Told(names + uses).ends_with("stopped after 20 errors\n"));
  EXPECT_TRUE(Told(items).starts_with("1:1: error: expected 'var'"));
  EXPECT_LT(Told("output " + std::string(300000, 'n') + ";").size(), 2000u);
  EXPECT_TRUE(Told("output " + std::string(300000, 'n') + ";" + names).find("is not declared\n") != std::string::npos);
}

// Blanks, what is marked, and a comment behind it.
TEST(Reader, ShowsTheNeighbourhoodInALongLine) {
  struct {
    const char* why;
    std::size_t before, marked, behind;
    const char* left;
    std::size_t blanks, shown, comment;
    const char* right;
  } const rows[] = {
      // clang-format off
      {"all of a line that fits",      60,   3,  57, "",    60,   3,  57, ""},
      {"cut at both ends",            200,   3, 200, "...", 40,   3,  77, "..."},
      {"cut behind the mark",          10,   3, 300, "",    10,   3, 107, "..."},
      {"cut ahead of it",             300,   3,  10, "...", 107,  3,  10, ""},
      {"cut in a mark that is long",    0, 500,   0, "",     0, 120,   0, "..."},
      // clang-format on
  };
  for (const auto& row : rows) {
    const auto repeat = [](std::size_t times, char c) { return std::string(times, c); };
    const std::string told = Told(repeat(row.before, ' ') + repeat(row.marked, 'q') + repeat(row.behind, '%'));
    EXPECT_EQ(told.substr(told.find('\n') + 1), row.left + repeat(row.blanks, ' ') + repeat(row.shown, 'q') +
                                                    repeat(row.comment, '%') + row.right + '\n' +
                                                    repeat(std::string_view(row.left).size() + row.blanks, ' ') + '^' +
                                                    repeat(row.shown - 1, '~') + '\n')
        << row.why;
  }
}

// Whatever the bytes: it ends, and every place lies in the file.
TEST(Reader, SurvivesAnyBytes) {
  const std::string good =
      "set of string: s = {\"a\", \"\\\"\"}; var s: x = \"a\"; % c\narray [1..2] of var 1..9: n;\n"
      "constraint str_length(x, n[1]);\nconstraint str_table([x], [| \"a\" | \"b\" |]);\noutput x, n;\ninclude "
      "\"f\";\n";
  for (std::size_t cut = 0; cut <= good.size(); ++cut) Told(good.substr(0, cut));
  for (std::size_t at = 0; at < good.size(); ++at) {
    for (const char c : {'\0', '"', '{', ';', '\n', '\x80', '-', '.', '%', '\x7F'}) {
      std::string broken = good;
      broken[at] = c;
      Told(broken);
    }
  }
}

}  // namespace
