#include "network/search.h"

#include <algorithm>
#include <utility>

namespace zornet {

Search::Search(Store& store, Propagation& propagation)
    : mStore(store),
      mPropagation(propagation),
      mSemantics(store.Types()),
      mLeastWanted(store.Model().Variables().size()),
      mLeast(store.Model().Variables().size()),
      mStamps(store.Model().Variables().size(), 0),
      mFailures(store.Model().Constraints().size(), 0) {
  constexpr std::size_t kNowhere = -1;
  mPlaces.resize(mStamps.size(), kNowhere);
  const auto take = [&](int variable) {
    std::size_t& place = mPlaces[static_cast<std::size_t>(variable)];
    if (place != kNowhere) return;
    place = mOrder.size();
    mOrder.push_back(variable);
  };
  for (const int variable : store.Model().Wanted()) take(variable);
  mWanted = mOrder.size();
  for (const Constraint& constraint : store.Model().Constraints()) {
    for (const int variable : constraint.arguments) take(variable);
  }
  std::replace(mPlaces.begin(), mPlaces.end(), kNowhere, mOrder.size());
  for (std::size_t place = 0; place < mOrder.size(); ++place) {
    if (mStore.Count(mOrder[place]) == 0) mUnlisted.push_back(place);
  }
  Renew(mOrder);
}

Outcome Search::Run(std::uint64_t limit, const Solution& solution) {
  const Outcome outcome = Look(limit, solution);
  mExhausted = outcome == Outcome::Settled && mFrames.empty();
  for (; !mFrames.empty(); mFrames.pop_back()) {
    if (mFrames.size() > 1) Undo();
  }
  return outcome;
}

Outcome Search::Look(std::uint64_t limit, const Solution& solution) {
  Visit(solution);
  while (!mFrames.empty() && mFound < limit && mGoOn) {
    if (mFrames.back().IsExhausted()) {
      Pop();
      continue;
    }
    if (!mPropagation.CountStep()) return mPropagation.WhyEnded();
    Mark();
    Choose(mFrames.back());
    const Outcome outcome = mPropagation.Run();
    if (outcome == Outcome::Settled) {
      FindChanged();
      Renew(mChanged);
      if (!Visit(solution)) Retract();
      continue;
    }
    const int failed = mStore.FailedConstraint();
    Undo();
    if (outcome != Outcome::Contradiction) return outcome;
    CountFailure(failed);
  }
  return Outcome::Settled;
}

// Whether there is something to branch on below what is settled now.
bool Search::Visit(const Solution& solution) {
  if (IsStuck()) {
    LeaveOpen();
    return false;
  }
  std::size_t first = mFrames.empty() ? 0 : mFrames.back().first;
  while (first < mOrder.size() && !Needs(first)) ++first;
  if (first >= mWanted && IsLoose() && mShown.contains(Shown())) return false;
  if (first == mOrder.size()) {
    Leaf(solution);
    return false;
  }
  Push(first, Pick());
  return true;
}

// The place of the variable with the fewest values for the contradictions of its constraints, a wanted one if there is
// one, or of the first that has few enough. Where nothing is stuck, one is listed.
std::size_t Search::Pick() const {
  const double enough = 2.0 / static_cast<double>(1 + mFailed);  // hardly any is below
  const Tournament& keys = mLeastWanted.Least() != Tournament::kOut ? mLeastWanted : mLeast;
  return keys.FirstUpTo(std::max(enough, keys.Least()));
}

double Search::KeyOf(std::size_t place) const {
  const std::size_t count = Needs(place) ? mStore.Count(mOrder[place]) : 0;
  return count == 0 ? Tournament::kOut : static_cast<double>(count) / static_cast<double>(WeightOf(mOrder[place]));
}

void Search::Renew(std::span<const int> variables) {
  for (const int variable : variables) {
    const std::size_t place = mPlaces[static_cast<std::size_t>(variable)];
    if (place < mOrder.size()) (place < mWanted ? mLeastWanted : mLeast).Set(place, KeyOf(place));
  }
}

// Since the latest mark.
void Search::FindChanged() {
  mChanged.clear();
  mStore.AddChanged(mChanged);
  for (const int constraint : mPropagation.FinishedSinceMark()) {
    const auto& arguments = mStore.Model().Constraints()[static_cast<std::size_t>(constraint)].arguments;
    mChanged.insert(mChanged.end(), arguments.begin(), arguments.end());
  }
}

std::uint64_t Search::WeightOf(int variable) const {
  std::uint64_t weight = 1;
  for (const int constraint : mPropagation.ReadersOf(variable)) {
    if (!mPropagation.IsFinished(constraint)) weight += mFailures[static_cast<std::size_t>(constraint)];
  }
  return weight;
}

void Search::Push(std::size_t first, std::size_t place) {
  const bool decided = first >= mWanted;
  const Listing& listing = mStore.List(mOrder[place]);
  const bool halved = listing.sort == Sort::Interval && listing.count > mPropagation.Bounds().budget;
  mFrames.push_back({mOrder[place], listing, halved, first, decided, IsLoose() || (!decided && place >= mWanted)});
}

void Search::Pop() {
  const bool decided = IsDecided(), loose = IsLoose();
  mFrames.pop_back();
  if (!mFrames.empty()) Retract();
  if (loose && !IsLoose()) mShown.clear();
  if (decided && !IsDecided() && !mWitnessOpen.empty()) CountOpen(std::exchange(mWitnessOpen, {}));
}

void Search::Choose(Frame& frame) {
  const Listing& listing = frame.listing;
  const std::size_t choice = frame.next++, middle = (listing.count - 1) / 2;
  Value& value = mStore.FreshLike(frame.variable);
  if (IsText(listing.sort)) {
    value.SetText(listing.texts[choice]);
  } else if (!frame.halved) {
    value.SetNumber(listing.NumberAt(choice));
  } else if (choice == 0) {
    value.SetNumbers({listing.NumberAt(0), listing.NumberAt(middle)});
  } else {
    value.SetNumbers({listing.NumberAt(middle + 1), listing.NumberAt(listing.count - 1)});
  }
  mStore.StartConstraint(kNone);
  mStore.StartOperation(Operation::Choice);
  mStore.Meet(frame.variable, value);
}

// A choice itself fails nothing: its value is one of the domain.
void Search::CountFailure(int constraint) {
  if (constraint == kNone) return;
  ++mFailures[static_cast<std::size_t>(constraint)];
  ++mFailed;
  Renew(mStore.Model().Constraints()[static_cast<std::size_t>(constraint)].arguments);
}

void Search::Mark() {
  mStore.Mark();
  mPropagation.Mark();
}

void Search::Undo() {
  mStore.Undo();
  mPropagation.Undo();
}

void Search::Retract() {
  FindChanged();
  Undo();
  Renew(mChanged);
}

// Whether the variable still has to get one value. Beside the wanted ones, finished constraints need none.
bool Search::Needs(std::size_t place) const {
  const int variable = mOrder[place];
  return !mStore[variable].IsOne() && (place < mWanted || mPropagation.Waits(variable));
}

// Whether variables that are needed cannot become known any more: at first any of them, and then those that are
// connected to what the latest choice has changed. Those that unfinished constraints connect cannot together, so that
// none is met twice.
bool Search::IsStuck() {
  mStuck.clear();
  if (mUnlisted.empty()) return false;
  const std::uint64_t before = mStamp;
  if (mFrames.empty()) {
    for (const std::size_t place : mUnlisted) CheckForStuck(mOrder[place], before);
  }
  for (const int variable : mChanged) {
    CheckForStuck(variable, before);
    for (const int reader : mPropagation.ReadersOf(variable)) {
      if (mPropagation.IsFinished(reader)) continue;
      for (const int other : mStore.Model().Constraints()[static_cast<std::size_t>(reader)].arguments)
        CheckForStuck(other, before);
    }
  }
  return !mStuck.empty();
}

void Search::CheckForStuck(int variable, std::uint64_t before) {
  const std::size_t place = mPlaces[static_cast<std::size_t>(variable)];
  if (place < mOrder.size() && Needs(place) && mStore.Count(variable) == 0 && !CanBecomeKnown(variable, before))
    mStuck.insert(mStuck.end(), mReached.begin(), mReached.end());
}

// Whether unfinished constraints connect it to a variable that there are choices for, or it has been asked about. What
// has a stamp above before and not the latest was reached from another that can become known.
bool Search::CanBecomeKnown(int variable, std::uint64_t before) {
  const auto stamp = [this](int other) -> std::uint64_t& { return mStamps[static_cast<std::size_t>(other)]; };
  if (stamp(variable) > before) return true;
  stamp(variable) = ++mStamp;
  mReached.assign(1, variable);
  for (std::size_t i = 0; i < mReached.size(); ++i) {
    for (const int number : mPropagation.ReadersOf(mReached[i])) {
      if (mPropagation.IsFinished(number)) continue;
      for (const int other : mStore.Model().Constraints()[static_cast<std::size_t>(number)].arguments) {
        if (mStore[other].IsOne() || stamp(other) == mStamp) continue;
        if (mStore.Count(other) > 0 || stamp(other) > before) return true;
        stamp(other) = mStamp;
        mReached.push_back(other);
      }
    }
  }
  return false;
}

// One open branch is enough to leave a whole assignment of the wanted variables open, unless a witness is found.
void Search::LeaveOpen() {
  if (IsDecided()) {
    mWitnessOpen = mStuck;
  } else {
    CountOpen(mStuck);
  }
}

void Search::CountOpen(const std::vector<int>& variables) {
  ++mOpen;
  mOpenVariables.insert(variables.begin(), variables.end());
}

void Search::Leaf(const Solution& solution) {
  if (!Confirm()) return;
  if (IsLoose()) mShown.insert(Shown());
  mWitnessOpen.clear();
  for (auto frame = mFrames.rbegin(); frame != mFrames.rend() && frame->decided; ++frame)
    frame->next = frame->halved ? 2 : frame->listing.count;
  ++mFound;
  mGoOn = solution();
}

// Each constraint by itself. One that an argument without a value is left to is finished: it holds for any.
bool Search::Confirm() {
  const auto& constraints = mStore.Model().Constraints();
  return std::all_of(constraints.begin(), constraints.end(), [this](const Constraint& constraint) {
    mExact.clear();
    for (const int variable : constraint.arguments) {
      if (!mStore[variable].IsOne()) return true;
      const Listing& listing = mStore.List(variable);
      const bool text = IsText(listing.sort);
      mExact.push_back({text ? &listing.texts.front() : nullptr, text ? 0 : listing.NumberAt(0), listing.sort});
    }
    return mSemantics.Holds(constraint, mExact);
  });
}

// The wanted values as they are printed.
std::string Search::Shown() const {
  std::string shown;
  for (std::size_t place = 0; place < mWanted; ++place) shown += mStore[mOrder[place]].Show() + '\n';
  return shown;
}

}  // namespace zornet
