// The leftmost place with a small key, in logarithmic time: a tournament tree (Knuth, The Art of Computer Programming,
// 5.4.1).
#pragma once

#include <cstddef>
#include <limits>
#include <vector>

namespace zornet {

class Tournament {
 public:
  static constexpr double kOut = std::numeric_limits<double>::infinity();  // of a place that does not take part

  explicit Tournament(std::size_t places);  // none takes part

  void Set(std::size_t place, double key);
  double Least() const { return mKeys[1]; }
  std::size_t FirstUpTo(double key) const;  // the leftmost place with such a key at most; there is one

 private:
  std::size_t mLeaves;
  std::vector<double> mKeys;  // the lesser key of nodes 2i and 2i + 1 at i; the leaves last
};

}  // namespace zornet
