// Equality and order between two integers or truth values. A truth value equals the integer 0 or 1.
#pragma once

#include "network/status.h"
#include "network/store.h"

namespace zornet {

class NumberRelations {
 public:
  explicit NumberRelations(Store& store) : mStore(store) {}

  Status Post(Meaning meaning, int x, int y);
  bool Ask(Meaning meaning, int x, int y, Value& answer);  // false while the relation is open

 private:
  Status Equal(int x, int y);
  Status Unequal(int x, int y);
  Status Ordered(int x, int y, std::int64_t distance);
  void Equate(int target, int other);
  void Remove(int target, int other);

  Store& mStore;
};

}  // namespace zornet
