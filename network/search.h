// Full assignments: every listed variable is given each of its values in turn, the rest is narrowed, and what is left
// at the end is confirmed constraint by constraint.
#pragma once

#include <cstdint>
#include <functional>
#include <vector>

#include "network/propagation.h"
#include "network/store.h"
#include "network/truth.h"

namespace zornet {

class Search {
 public:
  using Solution = std::function<bool()>;  // the store holds it; false when no other is wanted

  Search(Store& store, Propagation& propagation) : mStore(store), mPropagation(propagation), mTruth(store.Types()) {}

  // Goes on from a network that was settled, and leaves it so. Settled: stopped at the limit, because no other is
  // wanted or because there are no more.
  Outcome Run(std::uint64_t limit, const Solution& solution);

  std::uint64_t Found() const { return mFound; }
  std::uint64_t Open() const { return mOpen; }        // assignments that leave a variable unknown
  int OpenVariable() const { return mOpenVariable; }  // one such variable
  bool IsComplete() const { return mComplete; }       // there are no more

 private:
  struct Frame {
    int variable;
    Listing listing;
    std::size_t next = 0;
  };

  Outcome Look(std::uint64_t limit, const Solution& solution);
  bool Descend();
  void Choose(int variable, const Listing& listing, std::size_t index);
  void Mark();
  void Retract();
  void Leaf(const Solution& solution);
  bool Confirm();

  Store& mStore;
  Propagation& mPropagation;
  Truth mTruth;
  std::vector<Frame> mFrames;
  std::uint64_t mFound = 0;
  std::uint64_t mOpen = 0;
  int mOpenVariable = kNone;
  bool mWanted = true;
  bool mComplete = false;
};

}  // namespace zornet
