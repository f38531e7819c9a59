// What is told of broken models: place, caret, note.
#include "language/reader.h"

#include <fmt/core.h>
#include <gtest/gtest.h>

#include "zornet/render.h"

namespace {

struct Row {
  const char* why;
  const char* model;
  const char* told;  // without the name of the file
};

// clang-format off
const Row kBroken[] = {
  {"a misspelt variable points at the one that was meant",
   "var string: name;\nconstraint str_eq(naem, \"a\");\n",
   "2:19: error: 'naem' is not declared; did you mean 'name'?\n"
   "constraint str_eq(naem, \"a\");\n"
   "                  ^~~~\n"
   "1:13: note: 'name' is declared here\n"
   "var string: name;\n"
   "            ^~~~\n"},
  {"a name that is like no other gets no guess",
   "var string: x;\noutput something;\n",
   "2:8: error: 'something' is not declared\noutput something;\n       ^~~~~~~~~\n"},
  {"nor does a name too long for a slip",
   "var string: aaaaaaaaaabbbbbbbbbbccccccccccddddddddddeeeeeeeeeeffffffffffggggg;\n"
   "output aaaaaaaaaabbbbbbbbbbccccccccccddddddddddeeeeeeeeeeffffffffffgggg_;\n",
   "2:8: error: 'aaaaaaaaaabbbbbbbbbbccccccccccddddddddddeeeeeeeeeeffffffffffgggg_' is not declared\n"
   "output aaaaaaaaaabbbbbbbbbbccccccccccddddddddddeeeeeeeeeeffffffffffgggg_;\n"
   "       ^~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~~\n"},
  {"a misspelt constraint",
   "constraint str_lenght(\"a\", 1);\n",
   "1:12: error: there is no constraint 'str_lenght'; did you mean 'str_length'?\n"
   "constraint str_lenght(\"a\", 1);\n           ^~~~~~~~~~\n"},
  {"a misspelt type",
   "var strnig: x;\nconstraint str_eq(x, x);\n",
   "1:5: error: expected a type: string, set string, {\"a\", \"b\"}, int, 1..9, {1, 3} or bool; did you mean 'string'?\n"
   "var strnig: x;\n    ^~~~~~\n"},
  {"a misspelt item",
   "constrain str_eq(\"a\", \"a\");\n",
   "1:1: error: expected 'var', 'constraint' or 'output'; did you mean 'constraint'?\n"
   "constrain str_eq(\"a\", \"a\");\n^~~~~~~~~\n"},

  {"a wrong type points at the argument, with the declaration",
   "var 1..9: n;\nconstraint str_lower(n, \"a\");\n",
   "2:22: error: str_lower takes a text for x, and 'n' is an interval\n"
   "constraint str_lower(n, \"a\");\n                     ^\n"
   "1:11: note: 'n' is declared here\nvar 1..9: n;\n          ^\n"},
  {"a constant has no declaration",
   "constraint str_length(\"a\", true);\n",
   "1:28: error: str_length takes an integer for n, and this is a truth value\n"
   "constraint str_length(\"a\", true);\n                           ^~~~\n"},
  {"the wrong number of arguments is the fault of the whole call",
   "constraint str_concat(\"a\", \"b\");\n",
   "1:12: error: str_concat(x, y, z) takes 3 arguments, not 2\n"
   "constraint str_concat(\"a\", \"b\");\n           ^~~~~~~~~~~~~~~~~~~~\n"},
  {"an expression that cannot be read, at its fault",
   "var string: x;\nconstraint str_matches(x, \"ab[c\");\n",
   "2:30: error: no regular expression: missing ]: [c\n"
   "constraint str_matches(x, \"ab[c\");\n"
   "                             ^~\n"},
  {"more arguments than any constraint takes",
   "constraint str_eq(\"a\", \"b\", 1, 2, 3);\n",
   "1:12: error: str_eq(x, y) takes 2 arguments, not 5\n"
   "constraint str_eq(\"a\", \"b\", 1, 2, 3);\n           ^~~~~~~~~~~~~~~~~~~~~~~~~\n"},
  {"a set is no argument",
   "constraint str_eq(\"a\", {\"a\"});\n",
   "1:24: error: expected a variable or one constant, since a set stands in a declaration only\n"
   "constraint str_eq(\"a\", {\"a\"});\n                       ^\n"},

  {"a name declared twice",
   "var string: x;\nvar int: x;\n",
   "2:10: error: 'x' is declared already\nvar int: x;\n         ^\n"
   "1:13: note: here\nvar string: x;\n            ^\n"},
  {"a word of the language is no name",
   "var string: set;\n",
   "1:13: error: expected the name of the variable, and 'set' is a word of the language\n"
   "var string: set;\n            ^~~\n"},
  {"a value outside of its type",
   "var {\"a\", \"b\"}: x = {\"b\", \"c\"};\n",
   "1:27: error: the type does not allow this value\n"
   "var {\"a\", \"b\"}: x = {\"b\", \"c\"};\n                          ^~~\n"
   "1:5: note: the type is declared here\n"
   "var {\"a\", \"b\"}: x = {\"b\", \"c\"};\n    ^~~~~~~~~~\n"},
  {"a number outside of its interval",
   "var -3..3: n = 4;\n",
   "1:16: error: the type does not allow this value\nvar -3..3: n = 4;\n               ^\n"
   "1:5: note: the type is declared here\nvar -3..3: n = 4;\n    ^~~~~\n"},
  {"a value of another kind",
   "var string: x = 7;\n",
   "1:17: error: expected a text, this is an integer\nvar string: x = 7;\n                ^\n"},
  {"a set for a single text",
   "var string: x = {\"a\"};\n",
   "1:17: error: a set is no value for a text\nvar string: x = {\"a\"};\n                ^~~~~\n"
   "1:5: note: the type is declared here\nvar string: x = {\"a\"};\n    ^~~~~~\n"},
  {"a set of texts and numbers",
   "var {1, \"a\"}: x;\n",
   "1:9: error: expected an integer, this is a text\nvar {1, \"a\"}: x;\n        ^~~\n"},
  {"an empty set",
   "var {}: x;\n",
   "1:6: error: expected at least one text or integer between the braces\nvar {}: x;\n     ^\n"},
  {"an interval upside down",
   "var 9..1: n;\n",
   "1:5: error: the upper end of the interval is below the lower\nvar 9..1: n;\n    ^~~~\n"},
  {"a number of more than 32 bits",
   "var int: n = 2147483648;\n",
   "1:14: error: an integer lies between -2147483648 and 2147483647\n"
   "var int: n = 2147483648;\n             ^~~~~~~~~~\n"},

  {"a character outside the alphabet",
   "var string: x = \"a{b\";\n",
   "1:19: error: '{' is no character of a text: those are the ones from space to z, without {|}~\n"
   "var string: x = \"a{b\";\n                  ^\n"},
  {"columns count characters, and so do carets",
   "var string: x = \"\xC3\xA9\"; % \xC3\xA9\xC3\xA9\nvar string: \xC3\xA9;\n",
   "1:18: error: '\xC3\xA9' is no character of a text: those are the ones from space to z, without {|}~\n"
   "var string: x = \"\xC3\xA9\"; % \xC3\xA9\xC3\xA9\n                 ^\n"
   "2:13: error: '\xC3\xA9' has no meaning here\nvar string: \xC3\xA9;\n            ^\n"},
  {"control characters and stray bytes do not reach the terminal",
   "var string: x;\x1b\x9B% \xC2\x9B\x7F\n",
   "1:15: error: character 27 has no meaning here\nvar string: x;??% ??\n              ^\n"
   "1:16: error: '?' has no meaning here\nvar string: x;??% ??\n               ^\n"},
  {"a tab in the line stays one above the caret",
   "\tconstraint\tstr_eq(x, \"a\");\n",
   "1:20: error: 'x' is not declared\n\tconstraint\tstr_eq(x, \"a\");\n\t          \t       ^\n"},
  {"a text that is not closed ends with its line",
   "var string: x = \"abc;\nvar string: y = 5;\n",
   "1:17: error: the text has no closing quote on its line\nvar string: x = \"abc;\n                ^~~~~\n"
   "2:17: error: expected a text, this is an integer\nvar string: y = 5;\n                ^\n"},
  {"a percent sign in a text begins no comment",
   "var string: x = \"50% off\"\n",
   "1:26: error: expected ';' at the end of the declaration\nvar string: x = \"50% off\"\n                         ^\n"},

  {"a missing semicolon is told at the end of its line, and the next line is read",
   "var string: x\nvar strin: y;\nconstraint str_eq(x, y);\n",
   "1:14: error: expected ';' at the end of the declaration\nvar string: x\n             ^\n"
   "2:5: error: expected a type: string, set string, {\"a\", \"b\"}, int, 1..9, {1, 3} or bool; did you mean 'string'?\n"
   "var strin: y;\n    ^~~~~\n"},
  {"the end of the model in the middle of an item",
   "constraint str_eq(\"a\",",
   "1:23: error: the model ends here, expected a text in quotes, an integer, true or false\n"
   "constraint str_eq(\"a\",\n                      ^\n"},
  {"lines that end in the way of other systems",
   "var string: x;\r\nvar string: x;\r\n",
   "2:13: error: 'x' is declared already\nvar string: x;\n            ^\n"
   "1:13: note: here\nvar string: x;\n            ^\n"},
  {"errors come in the order of the file, whoever finds them",
   "constraint str_eq(a, a);\nvar x;\n",
   "1:19: error: 'a' is not declared\nconstraint str_eq(a, a);\n                  ^\n"
   "1:22: error: 'a' is not declared\nconstraint str_eq(a, a);\n                     ^\n"
   "2:5: error: expected a type: string, set string, {\"a\", \"b\"}, int, 1..9, {1, 3} or bool\nvar x;\n    ^\n"},
};
// clang-format on

std::string Told(const std::string& model) {
  const zornet::Source source("", model);
  zornet::Diagnostics diagnostics;
  zornet::Read(source, diagnostics);
  std::string text = zornet::Render(source, diagnostics, false);
  for (std::size_t at = 0; (at = text.find("\n:", at)) != std::string::npos;) text.erase(at + 1, 1);
  return text.empty() ? text : text.substr(1);
}

TEST(Reader, TellsWhatIsBroken) {
  for (const Row& row : kBroken) EXPECT_EQ(Told(row.model), row.told) << row.why;
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
  EXPECT_TRUE(all.ends_with("20:1: error: expected 'var', 'constraint' or 'output'\nnonsense;\n^~~~~~~~\n"));
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
      "var {\"a\", \"b\"}: x = \"a\"; % c\nvar 1..9: n;\nconstraint str_length(x, n);\noutput x, n;\n";
  for (std::size_t cut = 0; cut <= good.size(); ++cut) Told(good.substr(0, cut));
  for (std::size_t at = 0; at < good.size(); ++at) {
    for (const char c : {'\0', '"', '{', ';', '\n', '\x80', '-', '.', '%', '\x7F'}) {
      std::string broken = good;
      broken[at] = c;
      Told(broken);
    }
  }
}

TEST(Reader, ReadsAllThereIs) {
  const zornet::Source source("",
                              "var string:a;var set string : b;var {\"x\",\"x\", \"\"}:c;var int:d=-5;var -2..3:e=1;\n"
                              "var {3,1}:f={1};var bool:g=true;constraint str_eq(a,b);% end\noutput a,c;output g;");
  zornet::Diagnostics diagnostics;
  const zornet::Model model = zornet::Read(source, diagnostics).model;
  ASSERT_FALSE(diagnostics.Failed()) << zornet::Render(source, diagnostics, false);
  ASSERT_EQ(model.Variables().size(), 7u);
  EXPECT_EQ(model.Variables()[2].texts, (std::vector<std::string>{"", "x"}));
  EXPECT_EQ(model.Variables()[3].numbers, std::vector<std::int32_t>{-5});
  EXPECT_EQ(model.Variables()[4].numbers, (std::vector<std::int32_t>{1, 1}));
  EXPECT_EQ(model.Variables()[5].numbers, std::vector<std::int32_t>{1});
  EXPECT_EQ(model.Variables()[6].numbers, std::vector<std::int32_t>{1});
  EXPECT_EQ(model.Wanted(), (std::vector<int>{0, 2, 6}));
}

}  // namespace
