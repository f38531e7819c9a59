// Narrowing of functions of integers and truth values by their bounds. What is not known has all 32-bit integers, and
// a result outside them is none; 64 bits hold whatever is computed on the way.
#pragma once

#include <cstdint>
#include <vector>

#include "network/ZORModel.h"
#include "network/status.h"
#include "network/store.h"

namespace zornet {

class Arithmetic {
 public:
  explicit Arithmetic(Store& store) : mStore(store) {}

  Status Narrow(const Constraint& constraint);

  // Whether single values may be left that the bounds do not drop.
  bool NeedsSupports(const Constraint& constraint) const;
  bool HasManyOpen(const Constraint& constraint) const;  // too many variables have several values for that

 private:
  // A variable of a sum that is nought: the inputs count as they are, the result by its opposite.
  struct Term {
    int variable;
    std::int64_t factor;
    std::int64_t lowest = 0, highest = 0;  // of factor times variable
  };
  struct Range {
    std::int64_t lowest, highest;
    bool HasZero() const { return lowest <= 0 && highest >= 0; }
  };

  void Sum(const Constraint& constraint);
  void Collect(const Constraint& constraint);
  void Product(int x, int y, int z);
  static Range Multiply(Range x, Range y);
  static Range Divide(Range z, Range y);
  void Extreme(const Constraint& constraint);
  bool IsDecided(const Constraint& constraint) const;

  Range RangeOf(int variable) const { return {mStore.LowestNumber(variable), mStore.HighestNumber(variable)}; }
  void Bound(int variable, Range range) { mStore.Bound(variable, range.lowest, range.highest); }

  Store& mStore;
  std::vector<Term> mTerms;
};

}  // namespace zornet
