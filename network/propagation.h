// Narrows a network until nothing changes any more: constraints wait in a queue and are woken by the variables that
// they read. It ends, since every change leaves less in a variable, and it loses no solution (see Store and Semantics).
// Constraints in a circle, such as x + y = z and z + y = x, may take one number a pass from an interval, which may have
// 2^32: an interval that has changed kMostShavings times in one run is shaved no further.
#pragma once

#include <cstdint>
#include <functional>
#include <span>
#include <vector>

#include "network/all_different.h"
#include "network/functions.h"
#include "network/relations.h"
#include "network/shapes.h"
#include "network/stop.h"
#include "network/store.h"
#include "network/tables.h"

namespace zornet {

class Propagation {
 public:
  Propagation(Store& store, const Limits& limits);

  Outcome Run();

  // Reports now and then, with the steps made and the constraints waiting.
  using Teller = std::function<void(std::uint64_t steps, std::size_t waiting)>;
  void OnProgress(Teller teller) { mTeller = std::move(teller); }

  std::uint64_t Steps() const { return mSteps; }
  bool CountStep();  // false when there is none left, and the outcome says why
  Outcome WhyEnded() const { return mEnd; }
  const Limits& Bounds() const { return mLimits; }

  std::span<const int> ReadersOf(int variable) const;  // the constraints, as often as they name it
  bool IsFinished(int constraint) const { return mStates[static_cast<std::size_t>(constraint)] == Finished; }
  bool Waits(int variable) const;  // whether a constraint that reads it is not finished

  void AddLimitsMet(std::vector<LimitMet>& met) const;  // at the variables that waiting constraints would narrow

  // As in Store, for what is settled and what waits.
  void Mark() { mMarks.push_back(mFinished.size()); }
  void Undo();
  std::span<const int> FinishedSinceMark() const { return std::span(mFinished).subspan(mMarks.back()); }

 private:
  void Connect();
  void Wake(int constraint);
  void WakeReaders(int except);
  bool IsShaved(int variable);
  void FailCycle();
  Outcome LeaveOff(int constraint);
  Status Narrow(int constraint);
  Status Narrow(const Constraint& constraint);
  void RemoveTogether(int from, int unequal);
  int Next();

  Store& mStore;
  const Model& mModel;
  Limits mLimits;
  Stop mStop;
  Relations mRelations;
  Functions mFunctions;
  AllDifferent mAllDifferent;
  Tables mTables;
  Shapes mShapes;
  Teller mTeller;

  // Constraints that read a variable: mReaders[mFirstReader[v]] and those up to mFirstReader[v + 1].
  std::vector<int> mReaders;
  std::vector<std::uint32_t> mFirstReader;

  static constexpr unsigned kMostShavings = 4096;
  std::vector<unsigned> mShavings;  // by variable: changes of an interval in this run; empty before the first
  std::vector<int> mShaved;         // the variables that have some

  enum State : char { Idle, Waiting, Finished };
  std::vector<State> mStates;  // of the constraints
  std::vector<int> mQueue;     // a ring with a place for each constraint
  std::size_t mHead = 0;
  std::size_t mWaiting = 0;
  std::vector<int> mFinished;  // in the order in which they were
  std::vector<std::size_t> mMarks;
  std::uint64_t mSteps = 0;
  Outcome mEnd = Outcome::Settled;  // Settled: no limit was met
};

}  // namespace zornet
