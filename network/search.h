// Solutions: assignments of the variables that are wanted, each with one confirmed witness for the variables that
// constraints still need beside them. A variable that is neither wanted nor needed is left as it is.
//
// Wanted variables are branched on first. A variable whose values cannot be listed may become known by the choices for
// others; a branch in which it cannot any more is left at once and counted as open.
#pragma once

#include <cstdint>
#include <functional>
#include <set>
#include <span>
#include <string>
#include <vector>

#include "network/propagation.h"
#include "network/semantics.h"
#include "network/store.h"
#include "network/tournament.h"

namespace zornet {

class Search {
 public:
  using Solution = std::function<bool()>;  // the store holds it; false when no other is wanted

  Search(Store& store, Propagation& propagation);

  // Goes on from a network that was settled, and leaves it so. Settled: stopped at the limit, because no other is
  // wanted or because all is tried.
  Outcome Run(std::uint64_t limit, const Solution& solution);

  std::uint64_t Found() const { return mFound; }
  std::uint64_t Open() const { return mOpen; }  // branches left because variables stay unknown in them
  const std::set<int>& OpenVariables() const { return mOpenVariables; }  // these variables
  bool IsExhausted() const { return mExhausted; }                        // nothing is left to try

 private:
  struct Frame {
    int variable;
    Listing listing;
    bool halved;        // its two choices are the halves of an interval
    std::size_t first;  // no variable before this place in mOrder is needed
    bool decided;       // every wanted variable has one value: this looks for a witness
    bool loose;         // a branch on an unwanted variable came first: solutions below may repeat
    std::size_t next = 0;

    bool IsExhausted() const { return next == (halved ? 2 : listing.count); }
  };

  Outcome Look(std::uint64_t limit, const Solution& solution);
  bool Visit(const Solution& solution);
  std::size_t Pick() const;
  double KeyOf(std::size_t place) const;
  std::uint64_t WeightOf(int variable) const;
  void CountFailure(int constraint);
  void FindChanged();
  void Renew(std::span<const int> variables);
  void Push(std::size_t first, std::size_t place);
  void Pop();
  void Choose(Frame& frame);
  void Mark();
  void Undo();
  void Retract();
  bool Needs(std::size_t place) const;
  bool IsStuck();
  void CheckForStuck(int variable, std::uint64_t before);
  bool CanBecomeKnown(int variable, std::uint64_t before);
  void LeaveOpen();
  void CountOpen(const std::vector<int>& variables);
  void Leaf(const Solution& solution);
  bool Confirm();
  bool IsDecided() const { return !mFrames.empty() && mFrames.back().decided; }
  bool IsLoose() const { return !mFrames.empty() && mFrames.back().loose; }
  std::string Shown() const;

  Store& mStore;
  Propagation& mPropagation;
  Semantics mSemantics;
  std::vector<int> mOrder;             // variables that matter, the wanted ones first
  std::size_t mWanted = 0;             // so many of them are wanted
  std::vector<std::size_t> mPlaces;    // of the variables in mOrder; mOrder.size() of others
  Tournament mLeastWanted, mLeast;     // the keys of the places in mOrder
  std::vector<int> mChanged;           // variables that the latest choice has narrowed, or finished constraints of
  std::vector<std::size_t> mUnlisted;  // places in mOrder whose values could not be listed at first
  std::vector<std::uint64_t> mStamps;  // when CanBecomeKnown reached each variable last
  std::uint64_t mStamp = 0;
  std::vector<int> mReached;             // by CanBecomeKnown, for the latest variable
  std::vector<int> mStuck;               // variables that cannot become known any more
  std::vector<std::uint64_t> mFailures;  // contradictions of each constraint so far
  std::uint64_t mFailed = 0;             // of all
  std::vector<Frame> mFrames;
  std::vector<Exact> mExact;      // arguments of the constraint that is confirmed
  std::set<std::string> mShown;   // solutions below the first loose frame
  std::vector<int> mWitnessOpen;  // variables that stayed open while a witness was looked for
  std::uint64_t mFound = 0;
  std::uint64_t mOpen = 0;
  std::set<int> mOpenVariables;
  bool mGoOn = true;
  bool mExhausted = false;
};

}  // namespace zornet
