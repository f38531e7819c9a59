#include "network/number_relations.h"

#include <limits>
#include <utility>

namespace zornet {

Status NumberRelations::Post(Meaning meaning, int x, int y) {
  switch (meaning) {
    case Meaning::Equal:
      return Equal(x, y);
    case Meaning::Unequal:
      return Unequal(x, y);
    default:
      return Ordered(x, y, meaning == Meaning::Less ? 1 : 0);
  }
}

Status NumberRelations::Equal(int x, int y) {
  Equate(y, x);
  if (!mStore.HasFailed()) Equate(x, y);
  return mStore[x].IsOne() && mStore[y].IsOne() ? Status::Subsumed : Status::Fixpoint;
}

void NumberRelations::Equate(int target, int other) {
  if (IsInteger(mStore[target].Sort()) == IsInteger(mStore[other].Sort())) {
    mStore.StartOperation(Operation::Equal);
    mStore.Meet(target, mStore[other]);
  } else {
    mStore.StartOperation(Operation::Bounds);
    mStore.Bound(target, mStore[other].LowestNumber(), mStore[other].HighestNumber());
  }
}

Status NumberRelations::Unequal(int x, int y) {
  if (mStore[y].IsOne()) Remove(x, y);
  if (!mStore.HasFailed() && mStore[x].IsOne()) Remove(y, x);
  return mStore[x].Any().IsIntersected(mStore[y].Any()) == 0 ? Status::Subsumed : Status::Fixpoint;
}

void NumberRelations::Remove(int target, int other) {
  Value& outcome = mStore.CopyOf(target);
  mStore.StartOperation(Operation::Unequal);
  outcome.Any().CalcUnequalValue(mStore[other].Any());
  mStore.Meet(target, outcome);
}

// x + distance <= y
Status NumberRelations::Ordered(int x, int y, std::int64_t distance) {
  if (mStore[x].HighestNumber() + distance <= mStore[y].LowestNumber()) return Status::Subsumed;
  mStore.StartOperation(Operation::Bounds);
  mStore.Bound(x, std::numeric_limits<ZORLong>::min(), mStore[y].HighestNumber() - distance);
  if (!mStore.HasFailed()) mStore.Bound(y, mStore[x].LowestNumber() + distance, std::numeric_limits<ZORLong>::max());
  return Status::Fixpoint;
}

// x < y is not y <= x. The other relations are asked, or asked for their opposites.
bool NumberRelations::Ask(Meaning meaning, int x, int y, Value& answer) {
  if (meaning == Meaning::Less) std::swap(x, y);
  const bool isEquality = meaning == Meaning::Equal || meaning == Meaning::Unequal;
  mStore.StartOperation(isEquality ? Operation::IsEqual : Operation::IsLessOrEqual);
  const ZORVaDoAny &left = mStore[x].Any(), &right = mStore[y].Any();
  isEquality ? left.CalcIsEqual(right, answer.Boolean()) : left.CalcIsLessOrEqual(right, answer.Boolean());
  if (!answer.IsOne()) return false;
  const bool isOpposite = meaning == Meaning::Unequal || meaning == Meaning::Less;
  if (isOpposite) answer.SetNumber(1 - answer.LowestNumber());
  return true;
}

}  // namespace zornet
