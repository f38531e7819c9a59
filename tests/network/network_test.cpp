// The interface that programs use: what a model refuses, what domains tell, limits, explanations.
#include "network/ZORNetwork.h"

#include <gtest/gtest.h>

namespace {

using zornet::Model;
using zornet::Network;
using zornet::Outcome;
using zornet::Var;

TEST(Model, RefusesWhatItCannotHold) {
  struct {
    void (*add)(Model& model, Var text, Var number);
    const char* told;
  } const rows[] = {
      {[](Model& m, Var, Var) { m.Text("x", std::string(256, 'a')); },
       "a text has at most 255 characters, this one has 256"},
      {[](Model& m, Var, Var) {
         m.TextSet("x", {"a", "\n"});
       },
       "a text has characters from space to z only"},
      {[](Model& m, Var, Var) { m.TextSet("x", {}); }, "a set has at least one text"},
      {[](Model& m, Var, Var) { m.IntegerSet("x", {}); }, "a set has at least one integer"},
      {[](Model& m, Var, Var) { m.Interval("x", 2, 1); }, "the upper end of an interval is less than the lower"},
      {[](Model& m, Var x, Var) {
         m.Post("str_equal", {x, x});
       },
       "there is no constraint 'str_equal'"},
      {[](Model& m, Var x, Var) { m.Post("str_eq", {x}); }, "str_eq takes 2 arguments, not 1"},
      {[](Model& m, Var, Var n) {
         m.Post("str_eq", {"a", n});
       },
       "str_eq cannot take 'n' for y"},
      {[](Model& m, Var, Var) {
         m.Post("str_eq", {"a", Var{}});
       },
       "no variable of this model"},
      {[](Model& m, Var x, Var n) {
         m.Post("str_concat", {{x, "a", n}, x});
       },
       "str_concat cannot take 'n' for xs"},
      {[](Model& m, Var x, Var) {
         m.Post("str_concat", {std::vector<zornet::Argument>(), x});
       },
       "str_concat takes at least one member in xs"},
      {[](Model& m, Var x, Var) {
         m.Post("str_eq", {{x, "a"}, x});
       },
       "str_eq takes no list for x"},
      {[](Model& m, Var x, Var) {
         m.Post("str_matches", {x, "a(b"});
       },
       "missing ): a(b"},
      {[](Model& m, Var x, Var) {
         m.Post("str_table", {{x, x}, zornet::Rows{{{"a", "b"}, {"a"}}}});
       },
       "a row has 2 texts here, not 1"},
  };
  for (const auto& row : rows) {
    Model model;
    const Var text = model.Text("x"), number = model.Integer("n");
    try {
      row.add(model, text, number);
      ADD_FAILURE() << row.told;
    } catch (const std::invalid_argument& error) {
      EXPECT_EQ(error.what(), std::string(row.told));
    }
    EXPECT_EQ(model.Variables().size(), 2u) << row.told;
  }
}

TEST(Network, TellsDomainsOfEverySort) {
  Model model;
  const Var text = model.Text("x", "a"), set = model.TextSet("s", {"b", "a", "b"}), open = model.Text("o");
  const Var number = model.Integer("n", -3), interval = model.Interval("i", 1, 9),
            numbers = model.IntegerSet("k", {5, 2});
  const Var truth = model.Boolean("t", true), unknown = model.Boolean("u");
  const Network network(model);
  const struct {
    Var variable;
    bool any, one;
    const char* text;
  } rows[] = {{text, false, true, "\"a\""},     {set, false, false, "{ \"a\", \"b\" }"},
              {open, true, false, "Any"},       {number, false, true, "-3"},
              {interval, false, false, "1..9"}, {numbers, false, false, "{ 2, 5 }"},
              {truth, false, true, "true"},     {unknown, true, false, "Any"}};
  for (const auto& row : rows) {
    EXPECT_EQ(network[row.variable].IsAny(), row.any) << row.text;
    EXPECT_EQ(network[row.variable].IsOne(), row.one) << row.text;
    EXPECT_EQ(network[row.variable].Print(), row.text);
  }
  EXPECT_EQ(network[set].Texts(), (std::vector<std::string>{"a", "b"}));
  EXPECT_EQ(network[numbers].Numbers(), (std::vector<std::int32_t>{2, 5}));
  EXPECT_EQ(network[interval].Lowest(), 1);
  EXPECT_EQ(network[interval].Highest(), 9);
}

TEST(Network, ExplainsAContradiction) {
  Model model;
  const Var folder = model.Text("folder"), found = model.TextSet("found", {"a.zip", "b.zip"});
  const int joined = model.Post("str_concat", {"a", ".tar", folder});
  const int equal = model.Post("str_eq", {found, folder});
  Network network(std::move(model));
  EXPECT_EQ(network.FailedConstraint(), zornet::kNone);
  ASSERT_EQ(network.Narrow(), Outcome::Contradiction);
  EXPECT_EQ(network.FailedVariable(), found);
  EXPECT_EQ(network.FailedConstraint(), equal);
  EXPECT_TRUE(network[found].IsNil());
  const zornet::Explanation why = network.Explain(found);
  ASSERT_EQ(why.declared.size(), 1u);
  EXPECT_EQ(why.declared[0].value, "{ \"a.zip\", \"b.zip\" }");
  ASSERT_EQ(why.narrowings.size(), 2u);
  EXPECT_EQ(why.narrowings[0].constraint, joined);
  EXPECT_EQ(why.narrowings[0].after, "\"a.tar\"");
  EXPECT_EQ(why.narrowings[1].after, "Nil");
}

TEST(Network, SearchesAndComesBack) {
  Model model;
  const Var x = model.TextSet("x", {"a", "b"}), y = model.TextSet("y", {"b", "c"});
  model.Post("str_ne", {x, y});
  Network network(std::move(model));
  ASSERT_EQ(network.Narrow(), Outcome::Settled);
  std::vector<std::string> found;
  const zornet::SearchResult all = network.Search(9, [&] {
    found.push_back(network[x].Texts()[0] + network[y].Texts()[0]);
    return true;
  });
  EXPECT_EQ(found, (std::vector<std::string>{"ab", "ac", "bc"}));
  EXPECT_TRUE(all.complete);
  EXPECT_FALSE(network.Search(2, [] { return true; }).complete);
  EXPECT_EQ(network[x].Print() + network[y].Print(), "{ \"a\", \"b\" }{ \"b\", \"c\" }");
}

// A model in which x, y and z are sets or singles; what is left of them, and the solutions where they are counted.
TEST(Network, NarrowsListsAndParts) {
  struct {
    void (*build)(Model& model);
    const char* left;  // x and those behind it
    std::uint64_t solutions;
  } const rows[] = {
      {[](Model& m) {
         m.Post("str_concat", {m.Text("x"), m.Text("y"), "abc"});
       },
       "Any Any", 4},
      {[](Model& m) {
         m.Post("str_concat", {{m.TextSet("x"), "-", m.TextSet("y")}, "a-b-c"});
       },
       "{ \"a\", \"a-b\" } { \"b-c\", \"c\" }", 2},
      {[](Model& m) {
         const Var x = m.Text("x");
         m.Post("str_concat", {{x, "-", x}, m.TextSet("z", {"a-a", "a-b", "ab-ab"})});
       },
       "Any { \"a-a\", \"ab-ab\" }", 2},
      {[](Model& m) {
         m.Post("str_lower", {m.Text("x"), "a-b"});
       },
       "Any", 4},
      {[](Model& m) {
         m.Post("str_substr", {"abc", m.Interval("x", 1, 9), m.Interval("y", 0, 1), m.Text("z")});
       },
       "1..9 0..1 Any", 18},
      {[](Model& m) {
         m.Post("str_max", {m.Text("x"), "  ", "  "});
       },
       "Any", 3},
      {[](Model& m) {
         m.Post("str_min", {{m.TextSet("x", {"a", "c"}), m.TextSet("y", {"b", "d"}), "d"}, m.TextSet("z", {"b", "d"})});
       },
       "\"c\" \"b\" \"b\"", 1},

      {[](Model& m) {
         m.Post("str_prefix", {m.TextSet("x"), "ab"});
       },
       "{ \"\", \"a\", \"ab\" }", 3},
      {[](Model& m) {
         m.Post("str_contains", {"aab", m.TextSet("x")});
       },
       "{ \"\", \"a\", \"aa\", \"aab\", \"ab\", \"b\" }", 6},
      {[](Model& m) {
         m.Post("str_find", {"banana", m.TextSet("x", {"a", "na", "x", ""}), m.Interval("y", 1, 9)});
       },
       "{ \"a\", \"na\" } 1..2", 2},
      {[](Model& m) {
         m.Post("str_replace", {m.TextSet("x"), "a", "b", "bab"});
       },
       "\"aab\"", 1},
      {[](Model& m) {
         m.Post("str_replace_all", {"a-b-c", "-", m.Text("x"), "a, b, c"});
       },
       "\", \"", 1},
      {[](Model& m) {
         m.Post("str_matches_reif", {m.TextSet("x", {"a1", "ab", "b22"}), "[a-z][0-9]+", false});
       },
       "\"ab\"", 1},

      {[](Model& m) {
         const Var x = m.TextSet("x", {"a", "b"}), y = m.TextSet("y", {"a", "b"}),
                   z = m.TextSet("z", {"a", "b", "c", "d"});
         m.Post("str_all_different", {{x, y, z}});
       },
       "{ \"a\", \"b\" } { \"a\", \"b\" } { \"c\", \"d\" }", 4},
      {[](Model& m) {
         m.Post("str_table", {{m.TextSet("x", {"a", "b"}), m.Text("y"), m.TextSet("z")},
                              zornet::Rows{{{"a", "p", "1"}, {"c", "q", "2"}, {"b", "p", "3"}}}});
       },
       "{ \"a\", \"b\" } \"p\" { \"1\", \"3\" }", 2},
  };
  for (const auto& row : rows) {
    Model model;
    row.build(model);
    Network network(model);
    ASSERT_EQ(network.Narrow(), Outcome::Settled) << row.left;
    std::string left;
    for (int v = 0; v < static_cast<int>(model.Variables().size()); ++v) {
      if (!model.Variables()[static_cast<std::size_t>(v)].constant)
        left += (left.empty() ? "" : " ") + network[v].Print();
    }
    EXPECT_EQ(left, row.left);
    const zornet::SearchResult all = network.Search(99, [] { return true; });
    EXPECT_EQ(all.solutions, row.solutions) << row.left;
    EXPECT_TRUE(all.complete) << row.left;
  }
}

// Each text but one has a variable of its own: no search is needed to see that the last has none.
TEST(Network, MatchesWithoutSearch) {
  std::vector<std::string> texts;
  for (int i = 0; i < 200; ++i) texts.push_back("t" + std::to_string(i));
  Model model;
  std::vector<zornet::Argument> variables;
  for (int i = 0; i < 200; ++i) variables.emplace_back(model.TextSet("", texts));
  model.Post("str_all_different", {variables});
  variables.emplace_back(model.TextSet("", texts));
  EXPECT_EQ(Network(model).Narrow(), Outcome::Settled);
  model.Post("str_all_different", {variables});
  EXPECT_EQ(Network(model).Narrow(), Outcome::Contradiction);
}

TEST(Network, TellsWhereModulesAreMissing) { EXPECT_NO_THROW(Network(Model(), {}, {"/nowhere"})); }

}  // namespace
