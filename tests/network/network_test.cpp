// The interface that programs use: what a model refuses, what domains tell, limits, explanations.
#include "network/ZORNetwork.h"

#include <gtest/gtest.h>

namespace {

using zornet::Model;
using zornet::Network;
using zornet::Outcome;
using zornet::Var;

TEST(Model, RefusesWhatItCannotHold) {
  using Add = void (*)(Model & model, Var text, Var number);
  // clang-format off
  const std::pair<Add, const char*> rows[] = {
    {[](Model& m, Var, Var) { m.Text("x", std::string(256, 'a')); }, "a text has at most 255 characters, this one has 256"},
    {[](Model& m, Var, Var) { m.TextSet("x", {"a", "\n"}); }, "a text has characters from space to z only"},
    {[](Model& m, Var, Var) { m.TextSet("x", {}); }, "a set has at least one text"},
    {[](Model& m, Var, Var) { m.IntegerSet("x", {}); }, "a set has at least one integer"},
    {[](Model& m, Var, Var) { m.Interval("x", 2, 1); }, "the upper end of an interval is less than the lower"},
    {[](Model& m, Var x, Var) { m.Post("str_equal", {x, x}); }, "there is no constraint 'str_equal'"},
    {[](Model& m, Var x, Var) { m.Post("str_eq", {x}); }, "str_eq takes 2 arguments, not 1"},
    {[](Model& m, Var, Var n) { m.Post("str_eq", {"a", n}); }, "str_eq cannot take 'n' for y"},
    {[](Model& m, Var, Var) { m.Post("str_eq", {"a", Var{}}); }, "no variable of this model"},
    {[](Model& m, Var x, Var n) { m.Post("str_concat", {{x, "a", n}, x}); }, "str_concat cannot take 'n' for xs"},
    {[](Model& m, Var x, Var) { m.Post("str_concat", {std::vector<zornet::Argument>(), x}); }, "str_concat takes at least one member in xs"},
    {[](Model& m, Var x, Var) { m.Post("str_eq", {{x, "a"}, x}); }, "str_eq takes no list for x"},
    {[](Model& m, Var x, Var) { m.Post("str_matches", {x, "a(b"}); }, "missing ): a(b"},
    {[](Model& m, Var x, Var) { m.Post("str_table", {{x, x}, zornet::Rows{{{"a", "b"}, {"a"}}}}); }, "a row has 2 texts here, not 1"},
  };
  // clang-format on
  for (const auto& [add, told] : rows) {
    Model model;
    const Var text = model.Text("x"), number = model.Integer("n");
    try {
      add(model, text, number);
      ADD_FAILURE() << told;
    } catch (const std::invalid_argument& error) {
      EXPECT_EQ(error.what(), std::string(told));
    }
    EXPECT_EQ(model.Variables().size(), 2u) << told;
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

TEST(Network, GoesOnWhereItWasStopped) {
  std::atomic<bool> stop = false;
  zornet::Limits limits;
  limits.stop = &stop;
  Model model;
  const Var site = model.TextSet("site", {"a", "b"}), shown = model.Text("shown");
  model.Post("str_ne", {site, "b"});
  const int upper = model.Post("str_upper", {site, shown});
  Network network(std::move(model), limits);
  network.OnNarrowing([&](const zornet::Narrowing&) { stop = true; });
  EXPECT_EQ(network.Narrow(), Outcome::Stopped);
  EXPECT_TRUE(network[shown].IsAny());
  ASSERT_EQ(network.LimitsMet().size(), 1u);
  EXPECT_EQ(network.LimitsMet()[0].limit, zornet::Limit::Stop);
  EXPECT_EQ(network.LimitsMet()[0].constraint, upper);
  stop = false;
  EXPECT_EQ(network.Narrow(), Outcome::Settled);
  EXPECT_EQ(network[shown].Print(), "\"A\"");
  EXPECT_TRUE(network.LimitsMet().empty());
}

TEST(Network, TellsWhereModulesAreMissing) { EXPECT_NO_THROW(Network(Model(), {}, {"/nowhere"})); }

}  // namespace
