#include "network/tournament.h"

#include <algorithm>
#include <bit>

namespace zornet {

Tournament::Tournament(std::size_t places)
    : mLeaves(std::bit_ceil(std::max<std::size_t>(places, 2))), mKeys(2 * mLeaves, kOut) {}

void Tournament::Set(std::size_t place, double key) {
  std::size_t node = mLeaves + place;
  if (mKeys[node] == key) return;
  mKeys[node] = key;
  while ((node /= 2) > 0) mKeys[node] = std::min(mKeys[2 * node], mKeys[2 * node + 1]);
}

std::size_t Tournament::FirstUpTo(double key) const {
  std::size_t node = 1;
  while (node < mLeaves) node = mKeys[2 * node] <= key ? 2 * node : 2 * node + 1;
  return node - mLeaves;
}

}  // namespace zornet
