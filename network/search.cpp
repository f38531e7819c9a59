#include "network/search.h"

#include <algorithm>

namespace zornet {

Outcome Search::Run(std::uint64_t limit, const Solution& solution) {
  const Outcome outcome = Look(limit, solution);
  mComplete = mFrames.empty();
  for (; !mFrames.empty(); mFrames.pop_back()) {
    if (mFrames.size() > 1) Retract();
  }
  return outcome;
}

Outcome Search::Look(std::uint64_t limit, const Solution& solution) {
  if (!Descend()) Leaf(solution);
  while (!mFrames.empty() && mFound < limit && mWanted) {
    Frame& frame = mFrames.back();
    if (frame.next == frame.listing.count) {
      mFrames.pop_back();
      if (!mFrames.empty()) Retract();
      continue;
    }
    Mark();
    Choose(frame.variable, frame.listing, frame.next++);
    const Outcome outcome = mPropagation.Run();
    if (outcome == Outcome::Settled && Descend()) continue;
    if (outcome == Outcome::Settled) Leaf(solution);
    Retract();
    if (outcome == Outcome::StepLimit) return outcome;
  }
  return Outcome::Settled;
}

// Goes on with the variable that has the fewest values, if one still has several.
bool Search::Descend() {
  int chosen = kNone;
  std::size_t fewest = 0;
  for (int v = 0; v < static_cast<int>(mStore.Model().Variables().size()); ++v) {
    if (mStore[v].IsOne()) continue;
    const Listing& listing = mStore.List(v);
    if (!listing.known || (chosen != kNone && listing.count >= fewest)) continue;
    chosen = v;
    fewest = listing.count;
  }
  if (chosen == kNone) return false;
  mFrames.push_back({chosen, mStore.List(chosen)});
  return true;
}

void Search::Choose(int variable, const Listing& listing, std::size_t index) {
  Value& value = mStore.FreshLike(variable);
  if (IsText(listing.sort)) {
    value.SetText(listing.texts[index]);
  } else {
    value.SetNumber(listing.NumberAt(index));
  }
  mStore.StartConstraint(kNone);
  mStore.StartOperation(Operation::Choice);
  mStore.Meet(variable, value);
}

void Search::Mark() {
  mStore.Mark();
  mPropagation.Mark();
}

void Search::Retract() {
  mStore.Undo();
  mPropagation.Undo();
}

void Search::Leaf(const Solution& solution) {
  for (int v = 0; v < static_cast<int>(mStore.Model().Variables().size()); ++v) {
    if (mStore[v].IsOne()) continue;
    ++mOpen;
    mOpenVariable = v;
    return;
  }
  if (!Confirm()) return;
  ++mFound;
  mWanted = solution();
}

bool Search::Confirm() {
  return std::all_of(mStore.Model().Constraints().begin(), mStore.Model().Constraints().end(),
                     [&](const Constraint& c) {
                       std::array<Exact, kMostArguments> exact{};
                       for (int i = 0; i < c.kind->arity; ++i) {
                         const auto at = static_cast<std::size_t>(i);
                         const Listing& listing = mStore.List(c.arguments[at]);
                         exact[at] = {IsText(listing.sort) ? &listing.texts.front() : nullptr,
                                      IsText(listing.sort) ? 0 : listing.NumberAt(0), listing.sort};
                       }
                       return mTruth.Holds(*c.kind, exact.data());
                     });
}

}  // namespace zornet
