#include "network/order_cycles.h"

#include <algorithm>
#include <utility>
#include <vector>

#include "network/ZORNetwork.h"

namespace zornet {

namespace {

// What is ordered by a posted constraint: x <= y, or x < y; equal texts are ordered both ways.
template <class Visit>
void ForEachOrder(const Model& model, Visit visit) {
  for (const Constraint& constraint : model.Constraints()) {
    const Kind& kind = *constraint.kind;
    if (!kind.IsRelation() || kind.reified || kind.meaning == Meaning::Unequal) continue;
    const auto x = static_cast<std::size_t>(constraint.arguments[kind.mirrored ? 1 : 0]);
    const auto y = static_cast<std::size_t>(constraint.arguments[kind.mirrored ? 0 : 1]);
    visit(x, y, constraint);
    if (kind.meaning == Meaning::Equal) visit(y, x, constraint);
  }
}

// The variables in their strong components: two have the same one when each is ordered before the other.
class Components {
 public:
  explicit Components(const Model& model) : mFirst(model.Variables().size() + 1, 0), mVisits(model.Variables().size()) {
    ForEachOrder(model, [&](std::size_t x, std::size_t, const Constraint&) { ++mFirst[x + 1]; });
    for (std::size_t v = 1; v < mFirst.size(); ++v) mFirst[v] += mFirst[v - 1];
    mGreater.resize(mFirst.back());
    std::vector<std::size_t> next(mFirst.begin(), mFirst.end() - 1);
    ForEachOrder(model, [&](std::size_t x, std::size_t y, const Constraint&) { mGreater[next[x]++] = y; });
    for (std::size_t v = 0; v < mVisits.size(); ++v) {
      if (mVisits[v].number == 0) Visit(v);
    }
  }

  bool IsSame(std::size_t x, std::size_t y) const { return mVisits[x].component == mVisits[y].component; }

 private:
  struct Node {
    std::size_t number = 0;  // in the order of the visits, from 1
    std::size_t least = 0;   // the least number that is reached on the path
    std::size_t component = 0;
    std::size_t next = 0;  // the edge to follow
  };

  void Visit(std::size_t root);
  void Enter(std::size_t v);
  void Leave();

  std::vector<std::size_t> mFirst, mGreater;  // those greater than v: mGreater[mFirst[v]] up to mFirst[v + 1]
  std::vector<Node> mVisits;
  std::vector<std::size_t> mPath, mPending;
  std::size_t mNumbers = 0, mComponents = 0;
};

void Components::Enter(std::size_t v) {
  mVisits[v].number = mVisits[v].least = ++mNumbers;
  mVisits[v].next = mFirst[v];
  mPath.push_back(v);
  mPending.push_back(v);
}

// A path of its own instead of recursion: chains are as long as models.
void Components::Visit(std::size_t root) {
  Enter(root);
  while (!mPath.empty()) {
    const std::size_t v = mPath.back();
    if (mVisits[v].next == mFirst[v + 1]) {
      Leave();
      continue;
    }
    const std::size_t greater = mGreater[mVisits[v].next++];
    if (mVisits[greater].number == 0) {
      Enter(greater);
    } else if (mVisits[greater].component == 0) {
      mVisits[v].least = std::min(mVisits[v].least, mVisits[greater].number);
    }
  }
}

void Components::Leave() {
  const std::size_t v = mPath.back();
  mPath.pop_back();
  if (!mPath.empty()) mVisits[mPath.back()].least = std::min(mVisits[mPath.back()].least, mVisits[v].least);
  if (mVisits[v].least != mVisits[v].number) return;
  ++mComponents;
  std::size_t member = 0;
  do {
    member = mPending.back();
    mPending.pop_back();
    mVisits[member].component = mComponents;
  } while (member != v);
}

bool HasStrictOrder(const Model& model) {
  const auto& constraints = model.Constraints();
  return std::any_of(constraints.begin(), constraints.end(), [](const Constraint& constraint) {
    return constraint.kind->meaning == Meaning::Less && !constraint.kind->reified;
  });
}

}  // namespace

int FindOrderCycle(const Model& model) {
  if (!HasStrictOrder(model)) return kNone;
  const Components components(model);
  int found = kNone;
  ForEachOrder(model, [&](std::size_t x, std::size_t y, const Constraint& constraint) {
    if (found == kNone && constraint.kind->meaning == Meaning::Less && components.IsSame(x, y))
      found = static_cast<int>(&constraint - model.Constraints().data());
  });
  return found;
}

}  // namespace zornet
