// Narrowing of a function by trying combinations of what its arguments can be. A listed value without a partner among
// the others is dropped; what an unknown argument can be is collected. One pass finds all that can be found this way.
#pragma once

#include <array>
#include <utility>
#include <vector>

#include "network/store.h"
#include "network/truth.h"

namespace zornet {

class Supports {
 public:
  Supports(Store& store, Truth& truth, std::size_t budget) : mStore(store), mTruth(truth), mBudget(budget) {}

  // False when the combinations are more than the budget or cannot be listed; then nothing has changed.
  bool Narrow(const Constraint& constraint);

 private:
  // One variable of the constraint: what it can be, and what of it has found a partner.
  struct Column {
    int variable = kNone;
    const Listing* listing = nullptr;
    Listing clamped;         // in place of positions that are unknown or too many
    bool openAbove = false;  // the last of these stands for all positions above it too
    std::vector<char> kept;
    std::size_t dropped = 0;    // not kept so far
    std::size_t index = 0;      // what is tried
    std::vector<Answer> found;  // what a variable can be that is not listed
    bool open = false;          // it can be more than what was found

    bool IsListed() const { return listing->known; }
  };

  void Prepare(const Constraint& constraint);
  void ClampPositions(const Constraint& constraint);
  void ClampPosition(Column& column, std::int64_t last, bool openAbove);
  double Combinations(const Constraint& constraint, int target);
  bool Try(const Constraint& constraint, int target);
  bool TryOne(const Constraint& constraint, int target);
  bool Advance();
  void Choose(Column& column, std::size_t index);
  bool Accept(int target, Answer answer);
  void Keep(Column& column, std::size_t index);
  bool AllKept() const;

  void Apply(const Constraint& constraint);
  void Meet(Column& column);
  void MeetTexts(Column& column);
  void MeetNumbers(Column& column);
  void MeetFound(Column& column);
  Column& At(int position) { return mColumns[static_cast<std::size_t>(mColumnOf[static_cast<std::size_t>(position)])]; }
  bool IsTried(const Column& column) const;

  Store& mStore;
  Truth& mTruth;
  std::size_t mBudget;
  std::size_t mCount = 0;                               // of the columns in use
  std::array<Column, kMostArguments> mColumns;          // one for each different variable
  std::array<std::size_t, kMostArguments> mColumnOf{};  // by position
  std::array<Exact, kMostArguments> mExact{};           // what is tried, by position
  int mArity = 0;
  std::vector<Column*> mTried;                   // the columns whose combinations are tried
  std::vector<std::pair<double, int>> mTargets;  // by what it costs to reach them; the result ahead of its equals
};

}  // namespace zornet
