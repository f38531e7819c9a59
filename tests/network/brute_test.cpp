// The two promises, that it ends and that no solution is lost, against every assignment tried.
#include <gtest/gtest.h>

#include <cstdlib>
#include <set>

#include "tests/network/naive.h"
#include "tests/network/support.h"

namespace {

using Texts = std::vector<std::string>;

class Check {
 public:
  Check(const naive::Network& network, const Texts& universe, std::size_t budget)
      : mNetwork(network), mText(network.Write()) {
    mLimits.budget = budget;
    mLimits.steps = 100'000;
    naive::Solve(network, universe, [this](const naive::Assignment& solution) { mExpected.insert(solution); });
  }

  void Run() {
    Solved solved(mText, mLimits);
    const zornet::Outcome outcome = solved.Settle();
    ASSERT_NE(outcome, zornet::Outcome::StepLimit) << mText;
    if (outcome == zornet::Outcome::Contradiction) {
      ASSERT_TRUE(mExpected.empty()) << mText << "has solutions, like\n" << Describe(*mExpected.begin());
      return;
    }
    for (const naive::Assignment& solution : mExpected) ASSERT_NO_FATAL_FAILURE(CheckKept(solved, solution));
    ASSERT_NO_FATAL_FAILURE(CheckExact(solved));
    ASSERT_NO_FATAL_FAILURE(CheckSearch(solved));
  }

 private:
  static bool Allows(zornet::Store& store, int variable, const naive::Value& value) {
    if (store[variable].IsUndefined()) return true;
    const zornet::Listing& listing = store.List(variable);
    if (!listing.known) return false;
    for (std::size_t i = 0; i < listing.count; ++i) {
      const bool text = zornet::IsText(listing.sort);
      if (text ? zornet::ToView(listing.texts[i]) == value.text : listing.NumberAt(i) == value.number) return true;
    }
    return false;
  }

  void CheckKept(Solved& solved, const naive::Assignment& solution) {
    for (std::size_t v = 0; v < solution.size(); ++v) {
      ASSERT_TRUE(Allows(solved.store, static_cast<int>(v), solution[v]))
          << mText << "v" << v << " became " << solved.store[static_cast<int>(v)].Show() << " and lost\n"
          << Describe(solution);
    }
  }

  // Where one value is left for each variable, it settles to a solution or to a contradiction.
  void CheckExact(Solved& solved) {
    for (std::size_t v = 0; v < mNetwork.variables.size(); ++v) {
      if (!solved.store[static_cast<int>(v)].IsOne()) return;
    }
    ASSERT_NO_FATAL_FAILURE(CheckHolds(Current(solved)));
  }

  void CheckHolds(const naive::Assignment& assignment) const {
    for (const naive::Constraint& constraint : mNetwork.constraints) {
      ASSERT_TRUE(naive::Holds(mNetwork, constraint, assignment)) << mText << constraint.name << " fails for\n"
                                                                  << Describe(assignment);
    }
  }

  naive::Assignment Current(Solved& solved) const {
    naive::Assignment assignment;
    for (std::size_t v = 0; v < mNetwork.variables.size(); ++v) {
      const zornet::Listing& listing = solved.store.List(static_cast<int>(v));
      const bool text = zornet::IsText(listing.sort);
      assignment.push_back(text ? naive::Value{std::string(zornet::ToView(listing.texts[0])), 0}
                                : naive::Value{"", listing.NumberAt(0)});
    }
    return assignment;
  }

  void CheckSearch(Solved& solved) {
    std::set<naive::Assignment> found;
    zornet::Search search(solved.store, solved.propagation);
    const zornet::Outcome outcome = search.Run(1'000'000, [&] {
      const naive::Assignment assignment = Current(solved);
      EXPECT_TRUE(found.insert(assignment).second) << mText << "found twice:\n" << Describe(assignment);
      return true;
    });
    ASSERT_EQ(outcome, zornet::Outcome::Settled) << mText;
    for (const naive::Assignment& assignment : found) ASSERT_NO_FATAL_FAILURE(CheckHolds(assignment));
    if (search.Open() != 0) return;
    for (const naive::Assignment& solution : mExpected) {
      ASSERT_TRUE(found.contains(solution)) << mText << "not found:\n" << Describe(solution);
    }
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
  std::string mText;
  zornet::Limits mLimits;
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
    // The lower budgets leave large sets to the module's own operations, without the supports.
    for (const std::size_t budget : {65536, 6, 1}) {
      ASSERT_NO_FATAL_FAILURE(Check(network, universe, budget).Run()) << "network " << i << ", budget " << budget;
    }
  }
}
INSTANTIATE_TEST_SUITE_P(Seeds, BruteForce, testing::Range(1u, 9u));

}  // namespace
