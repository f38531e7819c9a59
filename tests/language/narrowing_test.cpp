// What the networks of models settle to, and what a search finds in them.
#include <fmt/core.h>
#include <gtest/gtest.h>

#include "network/search.h"
#include "tests/language/support.h"
#include "zornet/progress.h"

namespace {

TEST(Propagation, SettlesTo) {
  for (const Row& row : Rows("settled.txt")) {
    Solved solved(row.model);
    solved.Narrow();
    EXPECT_EQ(solved.Print() + "\n", row.expected) << row.why << row.model;
  }
}

// The module gives up at the 257th pair, though many pairs give one text.
TEST(Propagation, MorePairsThanASetLists) {
  std::string set;
  for (std::size_t i = 0; i < 17; ++i) set += (i == 0 ? "{\"" : ", \"") + std::string(i, 'a') + '"';
  Solved solved("var " + set + "}: x; var " + set + "}: y; var set string: z; constraint str_concat(x, y, z);");
  EXPECT_EQ(solved.Narrow(), zornet::Outcome::Settled);
  EXPECT_EQ(solved["z"].Texts().size(), 33u);
}

// What many constraints take from one set, in any order, stated either way round and more than once.
TEST(Propagation, ManyUnequalTexts) {
  std::string set, unequal;
  for (int i = 0; i < 100; ++i) {
    set += fmt::format("{}\"{}\"", i == 0 ? "" : ", ", i * 37 % 100);
    const std::string text = fmt::format("\"{}\"", i);
    if (i != 42) unequal += "constraint str_ne(" + (i % 2 == 0 ? "x, " + text : text + ", x") + ");";
  }
  const std::string model = "var {" + set + "}: x; var {\"42\", \"a\"}: y;" + unequal + unequal;
  Solved left(model), none(model + "constraint str_ne(x, \"42\");"), searched(model + "constraint str_le(x, y);");
  EXPECT_EQ(left.Narrow(), zornet::Outcome::Settled);
  EXPECT_EQ(left.Print("x"), "\"42\"");
  EXPECT_EQ(none.Narrow(), zornet::Outcome::Contradiction);
  EXPECT_EQ(searched.Search(9, [] { return true; }).solutions, 2u);
  EXPECT_EQ(left.Explain(left.Find("x")).narrowings.size(), 99u);
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

TEST(Search, SaysNoMoreThanItKnows) {
  for (const Row& row : Rows("searches.txt")) {
    Solved solved(row.model, {1000, 100});
    std::string told;
    const zornet::SearchResult result = solved.Search(100, [&] {
      told += solved.Print() + "\n";
      return true;
    });
    if (result.outcome == zornet::Outcome::Settled) told += "complete\n";
    if (result.outcome == zornet::Outcome::Contradiction) told += "contradiction\n";
    if (!result.complete) told += "open: " + solved.Name(result.openVariables.front()) + "\n";
    EXPECT_EQ(told, row.expected) << row.why;
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
      {"at the limit of steps", 9, 9, 4, 1, zornet::Outcome::StepLimit},
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
