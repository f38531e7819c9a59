// What the networks of models settle to, and what a search finds in them.
#include <fmt/core.h>
#include <gtest/gtest.h>

#include "network/search.h"
#include "tests/language/support.h"
#include "zornet/progress.h"

namespace {

struct Row {
  const char* why;
  const char* model;
  const char* settled;  // what the variables show, in their order
};

// clang-format off
const Row kNetworks[] = {
  {"a known result is not overwritten where an operand is unknown",
   "var string: x; var string: z = \"ab\"; constraint str_concat(x, \"b\", z);", "\"a\", \"ab\""},
  {"a text twice is half of the result", "var string: x; constraint str_concat(x, x, \"abab\");", "\"ab\""},
  {"what is no text twice goes",
   "var set string: x; var {\"aa\", \"ab\", \"bcbc\"}: z; constraint str_concat(x, x, z);",
   "{ \"a\", \"bc\" }, { \"aa\", \"bcbc\" }"},
  {"a slice whose end is far below its beginning is empty",
   "var {-2147483647, 3}: to; constraint str_substr(\"zzzzzz\", 5, to, \"\");", "{ -2147483647, 3 }"},
  {"for one text too", "var string: z; constraint str_substr(\"abcdefgh\", 5, -2147483648, z);", "\"\""},
  {"backwards too", "var {\"zaZa\", \"a\"}: x; constraint str_substr(x, 3, -2147483647, \"\");", "{ \"a\", \"zaZa\" }"},
  {"an end far behind the text", "var string: z; constraint str_substr(\"abc\", 0, 2147483647, z);", "\"abc\""},
  {"positions behind every text", "var string: x; var set string: z; constraint str_substr(x, 255, 300, z);", "Any, Min"},
  {"a slice that is not empty lies inside the longest text",
   "var string: x; var -9..900: from; var 0..800: to; var {\"abc\", \"ab\"}: z; constraint str_substr(x, from, to, z);",
   "Any, 0..253, 1..800, { \"ab\", \"abc\" }"},
  {"an end ahead of every text leaves the empty slice",
   "var string: x; var {-5, 0}: from; var {\"\", \"a\"}: z; constraint str_substr(x, from, -2, z);", "Any, { -5, 0 }, Min"},
  {"nor is it longer than its positions allow",
   "var string: x; var {\"abcd\", \"ab\"}: z; constraint str_substr(x, 2, 4, z);", "Any, \"ab\""},
  {"more numbers than memory has room for",
   "var 0..2000000000: v; var {\"1\", \"2\"}: x; constraint str_text(v, x);", "1..2, { \"1\", \"2\" }"},
  {"the length of a text of which nothing is known",
   "var string: x; var {254, 255, 256}: n; constraint str_length(x, n);", "Any, { 254, 255 }"},
  {"orders in a circle",
   "var string: a; var string: b; var string: c; constraint str_lt(a, b); constraint str_eq(b, c); constraint str_ge(a, c);",
   "Nil, Any, Any"},
  {"a set of one number shows as that number", "var {3, 4}: n; constraint str_text(n, \"4\");", "4"},
  {"above an unknown text", "var string: x; var {\"\", \"a\"}: y; constraint str_lt(x, y);", "Any, \"a\""},
  {"nor does an unknown minimum", "var string: x; var string: z = \"b\"; constraint str_min(x, \"c\", z);", "\"b\", \"b\""},
  {"the least text does not replace what it is compared with",
   "var string: x = \"a\"; var string: y = \" \"; constraint str_eq(x, y);", "Nil, Min"},
  {"a bound that a set did not list stays out",
   "var {\"a\", \"d\"}: x; var {\"c\", \"m\"}: y; constraint str_ge(x, y);", "\"d\", \"c\""},
  {"a strict order on sets cuts", "var {\"a\", \"z\"}: x; var {\"m\"}: y; constraint str_lt(x, y);", "\"a\", \"m\""},
  {"both ends of a strict order", "var {\"a\", \"m\"}: x; var {\"a\", \"m\"}: y; constraint str_gt(x, y);", "\"m\", \"a\""},
  {"known results narrow their operands",
   "var {\"a\", \"b\", \"ab\"}: x; var {\"c\", \"bc\"}: y; constraint str_concat(x, y, \"abc\");", "{ \"a\", \"ab\" }, { \"bc\", \"c\" }"},
  {"a guess of the inverse that is wrong is not kept, the right one is",
   "var string: x; constraint str_concat(x, \"ab\", \"abab\");", "\"ab\""},
  {"nothing ends like this", "var string: x; constraint str_concat(x, \"d\", \"abc\");", "Nil"},
  {"beside its equal the other side of a minimum stays open",
   "var string: x; constraint str_min(x, \"b\", \"b\");", "Any"},
  {"a minimum above an operand", "var string: x; constraint str_min(x, \"b\", \"c\");", "Nil"},
  {"an interval of lengths does not harm the text",
   "var string: x = \"abc\"; var 1..9: n; constraint str_length(x, n);", "\"abc\", 3"},
  {"a set of lengths picks the texts",
   "var {\"a\", \"bb\", \"ccc\"}: x; var {1, 3, 5}: n; constraint str_length(x, n);", "{ \"a\", \"ccc\" }, { 1, 3 }"},
  {"a sum of lengths above all texts",
   "var set string: x; var -7..900: n; constraint str_length(x, n);", "Any, 0..255"},
  {"folding back drops what is in the wrong case",
   "var set string: x; var {\"ab\", \"aB\"}: z; constraint str_lower(x, z);",
   "{ \"AB\", \"Ab\", \"aB\", \"ab\" }, \"ab\""},
  {"folding back by pairs of one form",
   "var {\"a\", \"A\", \"B\"}: x; var {\"a\", \"c\"}: z; constraint str_lower(x, z);", "{ \"A\", \"a\" }, \"a\""},
  {"one space folds to itself, also back",
   "var set string: x = {\" \", \"b\"}; var string: z = \" \"; constraint str_upper(x, z);", "\" \", Min"},
  {"the empty text is below one space",
   "var string: x = \"\"; var string: y = \" \"; var bool: b; constraint str_lt_reif(x, y, b);", "\"\", Min, true"},
  {"and not equal to it, whatever the type",
   "var string: x = \" \"; var {\"\", \"a\"}: y; var bool: b; constraint str_eq_reif(x, y, b);", "Min, { \"\", \"a\" }, false"},
  {"a relation that nothing decides stays open",
   "var {\"\", \"a\"}: x; var {\"\"}: y; var bool: b; constraint str_eq_reif(x, y, b);", "{ \"\", \"a\" }, Min, Any"},
  {"a truth value posts the opposite",
   "var {\"a\", \"b\", \"c\"}: x; var bool: b = false; constraint str_lt_reif(x, \"b\", b);", "{ \"b\", \"c\" }, false"},
  {"slices narrow their positions where one occurrence is left",
   "var int: f; var int: t; constraint str_substr(\"abcdef\", f, t, \"cd\");", "2, 3"},
  {"two occurrences leave a hull",
   "var 0..5: f; var 0..9: t; constraint str_substr(\"abcabc\", f, t, \"bc\");", "1..4, 2..9"},
  {"an end behind the text is as good as any other behind it",
   "var int: f; constraint str_substr(\"abcd\", f, 10, \"cd\");", "2"},
  {"an empty slice tells nothing of its place",
   "var int: f; var 0..3: t; constraint str_substr(\"abc\", f, t, \"\");", "Any, 0..3"},
  {"sets take part in slices",
   "var {\"abc\", \"xbd\", \"cba\"}: x; var set string: z; constraint str_substr(x, 1, 1, z); constraint str_ne(x, \"cba\");",
   "{ \"abc\", \"xbd\" }, \"b\""},
  {"the text before is the shorter one where a space was put behind",
   "var string: x; constraint str_next(x, \"ab \");", "\"ab\""},
  {"the least text has none before", "var string: x; constraint str_next(x, \"\");", "Nil"},
  {"text forms go both ways",
   "var int: n; var string: x; constraint str_text(n, \"12\"); constraint str_text(x, \"Min\");", "12, Min"},
  {"a text form that nothing has", "var int: n; constraint str_text(n, \"012\");", "Nil"},
  {"a text and its text form are never equal", "var string: x; var {\"a\"}: y; constraint str_text(y, x); constraint str_eq(x, y);",
   "Nil, \"a\""},
  {"one variable at two places is one text",
   "var {\"a\", \"b\"}: x; var {\"ab\", \"bb\"}: z; constraint str_concat(x, x, z);", "\"b\", \"bb\""},
  {"nothing is below the least text", "var string: x; constraint str_lt(x, \"\");", "Nil"},
  {"one text is its own successor", "var string: x; constraint str_next(x, x);", "Max"},
  {"below itself", "var string: x; constraint str_lt(x, x);", "Nil"},
  {"a sum outside the integers",
   "var int: z; constraint int_plus(2147483647, 1, z);", "Nil"},
  {"nor does a quotient wrap", "var int: x; constraint int_times(x, -1, -2147483648);", "Nil"},
  {"orders of integers in a circle",
   "var 0..2147483647: x; var 0..2147483647: y; constraint int_lt(x, y); constraint int_le(y, x);",
   "Nil, 0..2147483647"},
  {"distances in a circle",
   "var 0..2147483647: x; var int: y; var int: z; constraint int_plus(1, x, y); constraint int_eq(y, z); constraint int_plus(z, 1, x);",
   "0..2147483647, Any, Nil"},
  {"an order against a distance",
   "var 0..2147483647: x; var int: y; constraint int_plus(x, 1, y); constraint int_le(y, x);", "0..2147483647, Nil"},
  {"sums and products of one number twice",
   "var int: x; var -9..9: y; var int: z; constraint int_plus(x, x, 10); constraint int_times(y, y, 49); constraint int_lt(0, y);"
   "constraint int_plus(y, z, y);", "5, 7, 0"},
  {"a product by what may be nothing", "var -3..3: x; var 0..9: y; constraint int_times(x, y, 12);", "2..3, 4..6"},
  {"sets of integers keep what has a partner",
   "var {1, 4, 9}: x; var {2, 3}: y; var {3, 6, 20}: z; constraint int_plus(x, y, z);", "{ 1, 4 }, 2, { 3, 6 }"},
  {"from lengths to truths and back",
   "var {\"a\", \"bee\", \"ceder\"}: x; var int: n; var bool: long; var int: count; constraint str_length(x, n);"
   "constraint int_lt_reif(3, n, long); constraint bool2int(long, count); constraint int_plus(count, n, 6);",
   "\"ceder\", 5, true, 1"},
  {"not, and, or, implies",
   "var bool: a; var bool: b; var bool: c; constraint bool_not(a, b); constraint bool_and(a, c, true);"
   "constraint bool_imply(b, c); constraint bool_or(b, false, false);", "true, false, true"},
  {"changes travel along a chain, against the order of the file",
   "var set string: a; var set string: b; var {\"x\", \"y\"}: c;"
   "constraint str_concat(a, \"!\", b); constraint str_upper(c, a); constraint str_ne(c, \"y\");", "\"X\", \"X!\", \"x\""},
};
// clang-format on

TEST(Propagation, SettlesTo) {
  for (const Row& row : kNetworks) {
    Solved solved(row.model);
    solved.Narrow();
    EXPECT_EQ(solved.Print(), row.settled) << row.why << "\n" << row.model;
  }
}

// At the limit of 255 characters.
TEST(Propagation, GreatestText) {
  const std::string greatest(255, 'z'), long200(200, 'a');
  Solved solved("var string: over; var set string: in; var {\"" + long200 +
                "\", \"b\"}: x; var set string: sums; var set string: up;" + "constraint str_concat(\"" + long200 +
                "\", \"" + long200 + "\", over);" + "constraint str_eq(over, in);" +
                "constraint str_concat(x, x, sums); constraint str_upper(in, up); var bool: top; constraint "
                "str_eq_reif(over, \"" +
                greatest + "\", top);");
  EXPECT_EQ(solved.Narrow(), zornet::Outcome::Settled);
  EXPECT_EQ(solved.Print("over"), "Max");
  EXPECT_EQ(solved.Print("in"), "Max");
  EXPECT_EQ(solved.Print("sums"), "{ \"bb\", Max }");
  EXPECT_EQ(solved.Print("up"), '"' + std::string(255, 'Z') + '"');
  EXPECT_EQ(solved.Print("top"), "true");
}

TEST(Propagation, GreatestTextIsItsOwnSuccessor) {
  Solved solved("var set string: before; var {\"" + std::string(255, 'z') +
                "\"}: last; constraint str_next(before, last);");
  EXPECT_EQ(solved.Narrow(), zornet::Outcome::Settled);
  EXPECT_EQ(solved.Print("before"), "{ \"" + std::string(254, 'z') + "y\", Max }");
}

// The module gives up at the 257th pair, though many pairs give one text.
TEST(Propagation, MorePairsThanASetLists) {
  std::string set;
  for (std::size_t i = 0; i < 17; ++i) set += (i == 0 ? "{\"" : ", \"") + std::string(i, 'a') + '"';
  Solved solved("var " + set + "}: x; var " + set + "}: y; var set string: z; constraint str_concat(x, y, z);");
  EXPECT_EQ(solved.Narrow(), zornet::Outcome::Settled);
  EXPECT_EQ(solved["z"].Texts().size(), 33u);
}

// Beyond the budget the module's operations on whole sets are left.
TEST(Propagation, Budget) {
  const std::string model =
      "var {\"a\", \"b\"}: x; var {\"c\", \"d\"}: y; var {\"ac\", \"bx\", \"q\"}: z; constraint str_concat(x, y, z);";
  Solved within(model), beyond(model, {0, 1000});
  within.Narrow();
  beyond.Narrow();
  EXPECT_EQ(within.Print("x"), "\"a\"");
  EXPECT_EQ(beyond.Print("x"), "{ \"a\", \"b\" }");
  EXPECT_EQ(beyond.Print("z"), "\"ac\"");
}

// Many combinations with few results: one result in 300 pairs.
TEST(Propagation, IsDrivenFromTheResults) {
  std::string x, y, z, slices;
  for (int i = 0; i < 300; ++i) {
    const std::string first = i % 2 == 0 ? ", \"" : ", \"x";
    x += fmt::format("{}{}-\"", first, i);
    y += fmt::format("{}{}\"", first, i);
    z += fmt::format(", \"{}-{}\"", i, i);
    slices += fmt::format(", \"-{}\"", i);
  }
  const auto set = [](const std::string& list) { return "var {" + list.substr(2) + "}: "; };
  Solved joined(set(x) + "x; " + set(y) + "y; " + set(z) + "z; constraint str_concat(x, y, z);");
  joined.Narrow();
  for (const char* name : {"x", "y", "z"}) EXPECT_EQ(joined[name].Texts().size(), 150u) << name;
  Solved cut(set(z) + "x; var 0..9: from; var 1..12: to; " + set(slices) + "z; constraint str_substr(x, from, to, z);");
  cut.Narrow();
  EXPECT_EQ(cut.Print("from") + ' ' + cut.Print("to"), "1..3 2..12");
  EXPECT_EQ(cut["z"].Texts().size(), 300u);
}

TEST(Propagation, StepLimit) {
  Solved solved("var string: x; constraint str_eq(x, \"a\"); constraint str_ne(x, \"b\");", {65536, 1});
  EXPECT_EQ(solved.Narrow(), zornet::Outcome::StepLimit);
}

// Ten times the network, ten times the work.
TEST(Propagation, WorkGrowsWithTheNetwork) {
  const auto passes = [](int size) {
    std::string model = "var string: x0 = \"a\";\n";
    for (int i = 1; i <= size; ++i) {
      model += fmt::format("var set string: x{};\nconstraint str_concat(x{}, \"b\", x{});\n", i, i - 1, i);
    }
    Solved solved(model);
    EXPECT_EQ(solved.Narrow(), zornet::Outcome::Settled);
    EXPECT_EQ(solved.Print(fmt::format("x{}", size)), "Max");
    return solved.Steps();
  };
  EXPECT_LE(passes(10000), 11 * passes(1000));
}

// Each pass would take one number from an interval.
TEST(Propagation, ShavesNoIntervalToItsEnd) {
  Solved solved(
      "var 0..2147483647: x; var 1..2: by; var 0..2147483647: y; constraint int_plus(x, by, y);"
      "constraint int_plus(y, by, x);",
      {65536, 10000});
  EXPECT_EQ(solved.Narrow(), zornet::Outcome::Settled);
}

// clang-format off
const struct {
  const char* why;
  const char* model;
  const char* found;  // a solution after the other
  zornet::Outcome outcome;
  const char* open;  // the variable that stays open
} kSearches[] = {
  {"an open wanted variable", "var string: x; var {\"a\", \"b\"}: y;", "", zornet::Outcome::Open, "x"},
  {"an open variable under a constraint", "var string: x; var {\"p\", \"q\"}: y; constraint str_ne(x, y);",
   "", zornet::Outcome::Open, "x"},
  {"also where the other is wanted alone", "var string: x; var {\"p\", \"q\"}: y; constraint str_ne(x, y); output y;",
   "", zornet::Outcome::Open, "x"},
  {"a contradiction behind the choices",
   "var {\"a\", \"b\"}: x; var {\"a\", \"b\"}: y; var {\"a\", \"b\"}: z; constraint str_ne(x, y);"
   "constraint str_ne(y, z); constraint str_ne(x, z);", "", zornet::Outcome::Contradiction, ""},
  {"what is neither wanted nor constrained", "var {\"a\", \"b\"}: x; var string: note; output x;",
   "\"a\"; \"b\"; ", zornet::Outcome::Settled, ""},
  {"what a settled constraint needs no more", "var {\"a\", \"b\"}: x; var set string: s; var bool: b = false;"
   "constraint str_eq_reif(x, \"a\", b); constraint str_le(s, s); output x;", "\"b\"; ", zornet::Outcome::Settled, ""},
  {"each printed solution once", "var {\"a\", \"b\"}: x; var {\"c\", \"d\", \"e\"}: y; constraint str_ne(x, y); output x;",
   "\"a\"; \"b\"; ", zornet::Outcome::Settled, ""},
  {"known only by a choice for another, and then alike",
   "var string: n; var {\"a\", \"A\", \"b\"}: x; constraint str_lower(x, n); output n;",
   "\"a\"; \"b\"; ", zornet::Outcome::Settled, ""},
  {"no end of assignments beside an open variable",
   "var 0..2147483646: a; var 0..2147483646: b; var string: x;", "", zornet::Outcome::Open, "x"},
  {"a single integer by its bounds",
   "var int: n; var 1..2: x; constraint int_plus(x, 3, n); output n;", "4; 5; ", zornet::Outcome::Settled, ""},
  {"intervals beyond the budget are halved",
   "var -2147483648..2147483647: n; var string: x = \"abc\"; constraint str_length(x, n); output n;",
   "3; ", zornet::Outcome::Settled, ""},
};
// clang-format on

TEST(Search, SaysNoMoreThanItKnows) {
  for (const auto& row : kSearches) {
    Solved solved(row.model, {1000, 100});
    std::string found;
    const zornet::SearchResult result = solved.Search(100, [&] {
      found += solved.Print() + "; ";
      return true;
    });
    EXPECT_EQ(found, row.found) << row.why;
    EXPECT_EQ(result.outcome, row.outcome) << row.why;
    EXPECT_EQ(result.complete, *row.open == '\0') << row.why;
    if (!result.complete) {
      EXPECT_EQ(result.openVariable, solved.Find(row.open)) << row.why;
    }
  }
}

TEST(Search, StopsInTimeAndLeavesNoTrace) {
  struct {
    const char* why;
    std::uint64_t most, wanted, steps, found;
    zornet::Outcome outcome;
  } const rows[] = {
      {"at the limit", 3, 9, 1000, 3, zornet::Outcome::Settled},
      {"when no other is wanted", 9, 2, 1000, 2, zornet::Outcome::Settled},
      {"at the limit of steps", 9, 9, 6, 1, zornet::Outcome::StepLimit},
  };
  for (const auto& row : rows) {
    Solved solved("var {\"a\", \"b\"}: x; var {\"b\", \"c\"}: y; constraint str_ne(x, y);", {65536, row.steps});
    std::uint64_t found = 0;
    const zornet::SearchResult result = solved.Search(row.most, [&] { return ++found < row.wanted; });
    EXPECT_EQ(result.outcome, row.outcome) << row.why;
    EXPECT_EQ(result.solutions, row.found) << row.why;
    EXPECT_FALSE(result.complete) << row.why;
    EXPECT_EQ(solved.Print(), "{ \"a\", \"b\" }, { \"b\", \"c\" }") << row.why;
  }
}

TEST(Progress, IsToldOnceInAWhile) {
  testing::internal::CaptureStderr();
  std::string model = "var string: x0 = \"a\";";
  for (int i = 1; i <= 600; ++i) model += fmt::format("var string: x{}; constraint str_eq(x{}, x{});", i, i - 1, i);
  Solved solved(model);
  {
    zornet::ProgressLine shown(true, {}), silent(false, {}), patient(true);
    solved.OnProgress([&](std::uint64_t steps, std::size_t waiting) {
      for (zornet::ProgressLine* line : {&shown, &silent, &patient}) line->Show(steps, waiting);
    });
    solved.Narrow();
  }
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "\r\x1b[K0.0 s: 256 passes, 345 constraints waiting\r\x1b[K");
}

}  // namespace
