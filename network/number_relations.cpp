#include "network/number_relations.h"

#include <limits>
#include <utility>
#include <vector>

#include "network/semantics.h"

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
  if (IsInteger(mStore[target].Sort()) != IsInteger(mStore[other].Sort())) {
    mStore.StartOperation(Operation::Bounds);
    return mStore.Bound(target, mStore.LowestNumber(other), mStore.HighestNumber(other));
  }
  mStore.StartOperation(Operation::Equal);
  if (mStore.HasCandidates(other)) return mStore.MeetNumbers(target, mStore.List(other).numbers);
  mStore.Meet(target, mStore[other]);
}

Status NumberRelations::Unequal(int x, int y) {
  if (mStore[y].IsOne()) Remove(x, y);
  if (!mStore.HasFailed() && mStore[x].IsOne()) Remove(y, x);
  return mStore[x].Any().IsIntersected(mStore[y].Any()) == 0 ? Status::Subsumed : Status::Fixpoint;
}

void NumberRelations::Remove(int target, int other) {
  mStore.StartOperation(Operation::Unequal);
  if (mStore.HasCandidates(target)) {
    std::vector<ZORLong> numbers = mStore.List(target).numbers;
    std::erase(numbers, mStore[other].LowestNumber());
    return mStore.MeetNumbers(target, std::move(numbers));
  }
  const ZORLong number = mStore[other].LowestNumber();
  if (mStore[target].Sort() == Sort::IntegerSet && mStore[target].Integer().FindAtLeast(number) != number) return;
  mStore.Edit(target, [&](Value& value) { value.Any().CalcUnequalValue(mStore[other].Any()); });
}

// x + distance <= y. Candidates do not make it hold for good: a single that is left with them shows as unknown.
Status NumberRelations::Ordered(int x, int y, std::int64_t distance) {
  if (mStore[x].HighestNumber() + distance <= mStore[y].LowestNumber()) return Status::Subsumed;
  mStore.StartOperation(Operation::Bounds);
  mStore.Bound(x, std::numeric_limits<ZORLong>::min(), mStore.HighestNumber(y) - distance);
  if (!mStore.HasFailed()) mStore.Bound(y, mStore.LowestNumber(x) + distance, std::numeric_limits<ZORLong>::max());
  return Status::Fixpoint;
}

bool NumberRelations::Ask(Meaning meaning, int x, int y, Value& answer) {
  if (meaning == Meaning::Equal || meaning == Meaning::Unequal) {
    mStore.StartOperation(Operation::IsEqual);
    mStore[x].Any().CalcIsEqual(mStore[y].Any(), answer.Boolean());
    if (answer.IsOne() && meaning == Meaning::Unequal) answer.SetNumber(1 - answer.LowestNumber());
  } else {
    mStore.StartOperation(Operation::Bounds);
    if (Semantics::Relates(meaning, mStore.HighestNumber(x), mStore.LowestNumber(y))) {
      answer.SetNumber(1);
    } else if (!Semantics::Relates(meaning, mStore.LowestNumber(x), mStore.HighestNumber(y))) {
      answer.SetNumber(0);
    }
  }
  return answer.IsOne();
}

}  // namespace zornet
