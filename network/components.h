// Strong components of a directed graph (Tarjan), in time linear in its edges and without recursion: paths are as long
// as models.
#pragma once

#include <cstddef>
#include <span>
#include <vector>

namespace zornet {

class Components {
 public:
  // The edges of node v lead to targets[first[v]] up to targets[first[v + 1]].
  void Find(std::span<const std::size_t> first, std::span<const std::size_t> targets);

  // From 1. An edge leads to its own component or to one of a lower number.
  std::size_t Of(std::size_t node) const { return mNodes[node].component; }
  std::size_t Count() const { return mComponents; }

 private:
  struct Node {
    std::size_t number = 0;  // in the order of the visits, from 1
    std::size_t least = 0;   // the least number that is reached on the path
    std::size_t component = 0;
    std::size_t next = 0;  // the edge to follow
  };

  void Visit(std::size_t root);
  void Enter(std::size_t node);
  void Leave();

  std::span<const std::size_t> mFirst, mTargets;
  std::vector<Node> mNodes;
  std::vector<std::size_t> mPath, mPending;
  std::size_t mNumbers = 0, mComponents = 0;
};

}  // namespace zornet
