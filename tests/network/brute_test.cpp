// The two promises, that it ends and that no solution is lost, against every assignment tried.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <set>

#include "network/ZORNetwork.h"
#include "tests/network/naive.h"

namespace {

using Texts = std::vector<std::string>;

class Check {
 public:
  Check(const naive::Network& network, const Texts& universe, std::size_t budget, const std::vector<int>& wanted)
      : mNetwork(network), mSolved(Wanting(network.Build(), wanted), {budget, 1'000'000}), mText(Write()) {
    naive::Solve(network, universe, [this](const naive::Assignment& solution) { mExpected.insert(solution); });
  }

  void Run() {
    const zornet::Outcome outcome = mSolved.Narrow();
    ASSERT_NE(outcome, zornet::Outcome::StepLimit) << mText;
    if (outcome == zornet::Outcome::Contradiction) {
      ASSERT_TRUE(mExpected.empty()) << mText << "has solutions, like\n" << Describe(*mExpected.begin());
      return;
    }
    for (const naive::Assignment& solution : mExpected) ASSERT_NO_FATAL_FAILURE(CheckKept(solution));
    ASSERT_NO_FATAL_FAILURE(CheckExact());
    const auto& variables = mNetwork.variables;
    const bool hasAllNumbers = std::any_of(variables.begin(), variables.end(), [](const naive::Variable& variable) {
      return variable.type == naive::Type::Interval && variable.domain.empty();
    });
    if (hasAllNumbers) return;  // the search would try them
    ASSERT_NO_FATAL_FAILURE(CheckSearch());
  }

 private:
  static zornet::Model Wanting(zornet::Model model, const std::vector<int>& wanted) {
    for (const int variable : wanted) model.Want({variable});
    return model;
  }

  bool Allows(std::size_t v, const naive::Value& value) const {
    const zornet::Domain domain = mSolved[static_cast<int>(v)];
    if (naive::IsText(mNetwork.variables[v].type)) return domain.Admits(value.text);
    if (!domain.IsKnown()) return domain.IsAny();
    const auto holds = [](const auto& values, const auto& one) {
      return std::find(values.begin(), values.end(), one) != values.end();
    };
    if (mNetwork.variables[v].type == naive::Type::IntegerSet) return holds(domain.Numbers(), value.number);
    return domain.Lowest() <= value.number && value.number <= domain.Highest();
  }

  void CheckKept(const naive::Assignment& solution) {
    for (std::size_t v = 0; v < solution.size(); ++v) {
      ASSERT_TRUE(Allows(v, solution[v])) << mText << "v" << v << " became " << mSolved[static_cast<int>(v)].Print()
                                          << ' ' << mSolved[static_cast<int>(v)].PrintShape() << " and lost\n"
                                          << Describe(solution);
    }
  }

  // Where one value is left for each variable, it settles to a solution or to a contradiction.
  void CheckExact() {
    for (std::size_t v = 0; v < mNetwork.variables.size(); ++v) {
      if (!mSolved[static_cast<int>(v)].IsOne()) return;
    }
    ASSERT_NO_FATAL_FAILURE(CheckHolds(Current()));
  }

  void CheckHolds(const naive::Assignment& assignment) const {
    for (const naive::Constraint& constraint : mNetwork.constraints) {
      ASSERT_TRUE(naive::Holds(mNetwork, constraint, assignment)) << mText << constraint.kind->name << " fails for\n"
                                                                  << Describe(assignment);
    }
  }

  // Where several values are left, any will do: no constraint needs the variable.
  naive::Assignment Current() const {
    naive::Assignment assignment;
    for (std::size_t v = 0; v < mNetwork.variables.size(); ++v) {
      const zornet::Domain domain = mSolved[static_cast<int>(v)];
      const bool text = naive::IsText(mNetwork.variables[v].type);
      assignment.push_back(!domain.IsKnown() ? naive::Value()
                           : text            ? naive::Value{domain.Texts().back(), 0}
                                             : naive::Value{"", domain.Highest()});
    }
    return assignment;
  }

  naive::Assignment WantedOf(const naive::Assignment& assignment) const {
    naive::Assignment wanted;
    for (const int variable : mSolved.GetModel().Wanted())
      wanted.push_back(assignment[static_cast<std::size_t>(variable)]);
    return wanted;
  }

  void CheckSearch() {
    std::set<naive::Assignment> found;
    const zornet::SearchResult result = mSolved.Search(1'000'000, [&] {
      const naive::Assignment assignment = Current();
      CheckHolds(assignment);
      for (const int v : mSolved.GetModel().Wanted()) EXPECT_TRUE(mSolved[v].IsOne()) << mText << "v" << v;
      EXPECT_TRUE(found.insert(WantedOf(assignment)).second) << mText << "found twice:\n" << Describe(assignment);
      return !testing::Test::HasFailure();
    });
    ASSERT_EQ(result.complete, result.open == 0) << mText;
    ASSERT_EQ(result.outcome, !result.complete ? zornet::Outcome::Open
                              : found.empty()  ? zornet::Outcome::Contradiction
                                               : zornet::Outcome::Settled)
        << mText;
    if (!result.complete) return;
    for (const naive::Assignment& solution : mExpected) {
      ASSERT_TRUE(found.contains(WantedOf(solution))) << mText << "not found:\n" << Describe(solution);
    }
  }

  std::string Write() const {
    std::string text;
    for (std::size_t v = 0; v < mNetwork.variables.size(); ++v)
      text += "v" + std::to_string(v) + ": " + mSolved[static_cast<int>(v)].Print() + "\n";
    for (const naive::Constraint& constraint : mNetwork.constraints) {
      text += constraint.kind->name;
      for (const int argument : constraint.arguments) text += " v" + std::to_string(argument);
      if (!constraint.expression.empty()) text += " \"" + constraint.expression + '"';
      for (const auto& row : constraint.rows) {
        text += " |";
        for (const std::string& cell : row) text += " \"" + cell + '"';
      }
      text += "\n";
    }
    return text;
  }

  std::string Describe(const naive::Assignment& assignment) const {
    std::string text;
    for (std::size_t v = 0; v < assignment.size(); ++v) {
      const bool isText = naive::IsText(mNetwork.variables[v].type);
      text += "  v" + std::to_string(v) + " = " +
              (isText ? '"' + assignment[v].text + '"' : std::to_string(assignment[v].number)) + "\n";
    }
    return text;
  }

  const naive::Network& mNetwork;
  zornet::Network mSolved;
  std::string mText;
  std::set<naive::Assignment> mExpected;
};

// ZORNET_NETWORKS asks for another number of networks a seed.
std::size_t Networks() {
  const char* asked = std::getenv("ZORNET_NETWORKS");
  return asked != nullptr ? std::strtoul(asked, nullptr, 10) : 400;
}

class BruteForce : public testing::TestWithParam<unsigned> {};

TEST_P(BruteForce, LosesNoSolution) {
  std::mt19937 random(GetParam());
  for (std::size_t i = 0; i < Networks(); ++i) {
    Texts universe;
    const naive::Network network = naive::Random(random, universe);
    std::vector<int> wanted;
    for (std::size_t v = 0; i % 2 == 0 && v < network.variables.size(); ++v)
      if (random() % 3 == 0) wanted.push_back(static_cast<int>(v));
    // The lower budgets leave large sets to the module's own operations, without the supports.
    for (const std::size_t budget : {65536, 6, 2, 0}) {
      ASSERT_NO_FATAL_FAILURE(Check(network, universe, budget, wanted).Run())
          << "network " << i << ", budget " << budget;
    }
  }
}
INSTANTIATE_TEST_SUITE_P(Seeds, BruteForce, testing::Range(1u, 9u));

}  // namespace
