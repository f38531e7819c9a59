#include "network/propagation.h"

#include <algorithm>
#include <utility>

#include "network/offsets.h"
#include "network/order_cycles.h"

namespace zornet {

namespace {

constexpr std::uint64_t kProgressSteps = 256;
constexpr std::size_t kManyTexts = 64;

}  // namespace

Propagation::Propagation(Store& store, const Limits& limits)
    : mStore(store),
      mModel(store.Model()),
      mLimits(limits),
      mStop(limits),
      mRelations(store),
      mFunctions(store, limits.budget, mStop),
      mAllDifferent(store, mStop),
      mTables(store),
      mShapes(store) {
  Connect();
  mStates.resize(mModel.Constraints().size(), Idle);
  mQueue.resize(mModel.Constraints().size());
  for (std::size_t i = 0; i < mModel.Constraints().size(); ++i) Wake(static_cast<int>(i));
}

void Propagation::Connect() {
  mFirstReader.resize(mModel.Variables().size() + 1, 0);
  const auto each = [this](auto visit) {
    for (std::size_t c = 0; c < mModel.Constraints().size(); ++c) {
      for (const int variable : mModel.Constraints()[c].arguments)
        visit(static_cast<int>(c), static_cast<std::size_t>(variable));
    }
  };
  each([this](int, std::size_t variable) { ++mFirstReader[variable + 1]; });
  for (std::size_t v = 1; v < mFirstReader.size(); ++v) mFirstReader[v] += mFirstReader[v - 1];
  mReaders.resize(mFirstReader.back());
  std::vector<std::uint32_t> next(mFirstReader.begin(), mFirstReader.end() - 1);
  each([&](int constraint, std::size_t variable) { mReaders[next[variable]++] = constraint; });
}

Outcome Propagation::Run() {
  for (const int variable : mShaved) mShavings[static_cast<std::size_t>(variable)] = 0;
  mShaved.clear();
  if (mSteps == 0) FailCycle();
  if (mStore.HasFailed()) return Outcome::Contradiction;
  WakeReaders(kNone);
  while (mWaiting != 0) {
    if (!CountStep()) return mEnd;
    const int constraint = Next();
    const Status status = Narrow(constraint);
    if (mStore.HasFailed()) return Outcome::Contradiction;
    WakeReaders(status == Status::Again ? kNone : constraint);
    if (mStop.WasAsked()) return LeaveOff(constraint);
  }
  return Outcome::Settled;
}

// In the middle of a pass, which is still to be made.
Outcome Propagation::LeaveOff(int constraint) {
  --mSteps;
  Wake(constraint);
  return mEnd = mStop.Why();
}

// Once, before the first pass.
void Propagation::FailCycle() {
  int constraint = FindOrderCycle(mModel);
  if (constraint == kNone) constraint = FindOffsetConflict(mModel);
  if (constraint == kNone) return;
  const Constraint& found = mModel.Constraints()[static_cast<std::size_t>(constraint)];
  mStore.StartConstraint(constraint);
  mStore.StartOperation(found.kind->IsRelation() ? Operation::LessOrEqual : Operation::Sum);
  mStore.Fail(found.arguments[found.kind->mirrored ? 1 : 0]);
}

bool Propagation::CountStep() {
  mEnd = mStop.IsAsked() ? mStop.Why() : mSteps >= mLimits.steps ? Outcome::StepLimit : Outcome::Settled;
  if (mEnd != Outcome::Settled) return false;
  ++mSteps;
  if (mTeller && mSteps % kProgressSteps == 0) mTeller(mSteps, mWaiting);
  return true;
}

Status Propagation::Narrow(int constraint) {
  mStore.StartConstraint(constraint);
  const Constraint& posted = mModel.Constraints()[static_cast<std::size_t>(constraint)];
  Status status = Narrow(posted);
  const bool isOpen = status != Status::Subsumed && !mStore.HasFailed();
  if (isOpen && (mShapes.Narrow(posted) || mStore.WasFitted())) status = Status::Again;
  if (status == Status::Subsumed) {
    mStates[static_cast<std::size_t>(constraint)] = Finished;
    mFinished.push_back(constraint);
  }
  return status;
}

Status Propagation::Narrow(const Constraint& constraint) {
  if (Relations::AreUnequal(constraint)) {
    RemoveTogether(constraint.arguments[0], constraint.arguments[1]);
    RemoveTogether(constraint.arguments[1], constraint.arguments[0]);
  }
  if (constraint.kind->IsComparison()) return mRelations.Narrow(constraint);
  if (constraint.kind->meaning == Meaning::AllDifferent) return mAllDifferent.Narrow(constraint);
  if (constraint.kind->meaning == Meaning::Row) return mTables.Narrow(constraint);
  return mFunctions.Narrow(constraint);
}

// Texts that waiting constraints take from a large set go in one pass: one by one, each would move all greater ones. A
// watcher is told of each by itself.
void Propagation::RemoveTogether(int from, int unequal) {
  if (mStore.IsWatched() || mStore.Count(from) < kManyTexts || !mRelations.CanRemove(from, unequal)) return;
  std::vector<ZORString> texts{mStore[unequal].LowestText()};
  for (const int reader : ReadersOf(from)) {
    const Constraint& other = mModel.Constraints()[static_cast<std::size_t>(reader)];
    if (mStates[static_cast<std::size_t>(reader)] != Waiting || !Relations::AreUnequal(other)) continue;
    const int known = other.arguments[other.arguments[0] == from ? 1 : 0];
    if (mRelations.CanRemove(from, known)) texts.push_back(mStore[known].LowestText());
  }
  if (texts.size() > 1) mRelations.RemoveAll(from, std::move(texts));
}

// A constraint that finds in one pass all that it can find is not woken by its own changes.
void Propagation::WakeReaders(int except) {
  for (const int variable : mStore.Touched()) {
    if (IsShaved(variable)) continue;
    for (const int reader : ReadersOf(variable)) {
      if (reader != except) Wake(reader);
    }
  }
  mStore.Touched().clear();
}

// Whether the readers of a changed variable are left alone. Those of one that has become a single number are not.
bool Propagation::IsShaved(int variable) {
  const Value& value = mStore[variable];
  if (value.Sort() != Sort::Interval || value.IsOne()) return false;
  if (mShavings.empty()) mShavings.resize(mModel.Variables().size(), 0);
  unsigned& shavings = mShavings[static_cast<std::size_t>(variable)];
  if (shavings++ == 0) mShaved.push_back(variable);
  if (shavings == kMostShavings + 1) mStore.MeetLimit(Limit::Narrowings, variable, 0, kMostShavings);
  return shavings > kMostShavings;
}

void Propagation::AddLimitsMet(std::vector<LimitMet>& met) const {
  if (mEnd == Outcome::Settled) return;
  const bool isSteps = mEnd == Outcome::StepLimit;
  const Limit limit = isSteps ? Limit::Steps : mEnd == Outcome::TimeLimit ? Limit::Time : Limit::Stop;
  for (std::size_t i = 0; i < mWaiting; ++i) {
    const int constraint = mQueue[(mHead + i) % mQueue.size()];
    for (const int variable : mModel.Constraints()[static_cast<std::size_t>(constraint)].arguments)
      met.push_back({limit, {variable}, constraint, 0, isSteps ? mLimits.steps : 0});
  }
}

std::span<const int> Propagation::ReadersOf(int variable) const {
  const auto at = static_cast<std::size_t>(variable);
  return std::span(mReaders).subspan(mFirstReader[at], mFirstReader[at + 1] - mFirstReader[at]);
}

bool Propagation::Waits(int variable) const {
  const auto readers = ReadersOf(variable);
  return std::any_of(readers.begin(), readers.end(), [this](int reader) { return !IsFinished(reader); });
}

void Propagation::Wake(int constraint) {
  State& state = mStates[static_cast<std::size_t>(constraint)];
  if (state != Idle) return;
  state = Waiting;
  mQueue[(mHead + mWaiting++) % mQueue.size()] = constraint;
}

int Propagation::Next() {
  const int constraint = mQueue[mHead];
  mHead = (mHead + 1) % mQueue.size();
  --mWaiting;
  mStates[static_cast<std::size_t>(constraint)] = Idle;
  return constraint;
}

void Propagation::Undo() {
  while (mWaiting != 0) Next();
  while (mFinished.size() > mMarks.back()) {
    mStates[static_cast<std::size_t>(mFinished.back())] = Idle;
    mFinished.pop_back();
  }
  mMarks.pop_back();
}

}  // namespace zornet
