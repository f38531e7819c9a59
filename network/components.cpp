#include "network/components.h"

#include <algorithm>

namespace zornet {

void Components::Find(std::span<const std::size_t> first, std::span<const std::size_t> targets) {
  mFirst = first;
  mTargets = targets;
  mNodes.assign(first.size() - 1, {});
  mNumbers = mComponents = 0;
  for (std::size_t node = 0; node < mNodes.size(); ++node) {
    if (mNodes[node].number == 0) Visit(node);
  }
}

void Components::Enter(std::size_t node) {
  mNodes[node].number = mNodes[node].least = ++mNumbers;
  mNodes[node].next = mFirst[node];
  mPath.push_back(node);
  mPending.push_back(node);
}

void Components::Visit(std::size_t root) {
  Enter(root);
  while (!mPath.empty()) {
    const std::size_t node = mPath.back();
    if (mNodes[node].next == mFirst[node + 1]) {
      Leave();
      continue;
    }
    const std::size_t target = mTargets[mNodes[node].next++];
    if (mNodes[target].number == 0) {
      Enter(target);
    } else if (mNodes[target].component == 0) {
      mNodes[node].least = std::min(mNodes[node].least, mNodes[target].number);
    }
  }
}

void Components::Leave() {
  const std::size_t node = mPath.back();
  mPath.pop_back();
  if (!mPath.empty()) mNodes[mPath.back()].least = std::min(mNodes[mPath.back()].least, mNodes[node].least);
  if (mNodes[node].least != mNodes[node].number) return;
  ++mComponents;
  std::size_t member = 0;
  do {
    member = mPending.back();
    mPending.pop_back();
    mNodes[member].component = mComponents;
  } while (member != node);
}

}  // namespace zornet
