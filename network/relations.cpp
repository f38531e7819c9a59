#include "network/relations.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace zornet {

namespace {

bool TouchesLeast(const Value& value) { return IsLeastSomewhere(value.LowestText()); }

// Not (x < y) is y <= x.
Meaning Opposite(Meaning meaning) {
  switch (meaning) {
    case Meaning::Equal:
      return Meaning::Unequal;
    case Meaning::Unequal:
      return Meaning::Equal;
    case Meaning::LessOrEqual:
      return Meaning::Less;
    default:
      return Meaning::LessOrEqual;
  }
}

Operation RelationOf(Meaning meaning) {
  switch (meaning) {
    case Meaning::Equal:
    case Meaning::Unequal:
      return Operation::IsEqual;
    case Meaning::LessOrEqual:
      return Operation::IsLessOrEqual;
    default:
      return Operation::IsLess;
  }
}

bool IsOrder(Meaning meaning) { return meaning == Meaning::LessOrEqual || meaning == Meaning::Less; }

}  // namespace

Relations::Relations(Store& store)
    : mStore(store),
      mNumbers(store),
      mSingle(store.Types(), Sort::Text),
      mOther(store.Types(), Sort::Text),
      mSet(store.Types(), Sort::TextSet),
      mReified(store.Types(), Sort::Boolean) {}

Status Relations::Narrow(const Constraint& constraint) {
  const Meaning meaning = constraint.kind->meaning;
  const int x = constraint.arguments[constraint.kind->mirrored ? 1 : 0];
  const int y = constraint.arguments[constraint.kind->mirrored ? 0 : 1];
  if (!constraint.kind->reified) return Post(meaning, x, y);
  const int truth = constraint.arguments[2];
  if (!mStore[truth].IsOne()) return Decide(meaning, x, y, truth);
  if (mStore[truth].LowestNumber() != 0) return Post(meaning, x, y);
  return IsOrder(meaning) ? Post(Opposite(meaning), y, x) : Post(Opposite(meaning), x, y);
}

Status Relations::Post(Meaning meaning, int x, int y) {
  if (x == y) return Reflexive(meaning, x);
  if (!IsText(mStore[x].Sort())) return mNumbers.Post(meaning, x, y);
  switch (meaning) {
    case Meaning::Equal:
      return Equal(x, y);
    case Meaning::Unequal:
      return Unequal(x, y);
    default:
      return Ordered(x, y, meaning == Meaning::Less);
  }
}

Status Relations::Reflexive(Meaning meaning, int x) {
  mStore.StartOperation(meaning == Meaning::Unequal ? Operation::Unequal : Operation::LessOrEqual);
  if (!Semantics::Relates(meaning, ZORString(), ZORString())) mStore.Fail(x);
  return Status::Subsumed;
}

Status Relations::Equal(int x, int y) {
  Equate(x, y);
  if (!mStore.HasFailed()) Equate(y, x);
  return mStore[x].IsOne() && mStore[y].IsOne() ? Status::Subsumed : Status::Fixpoint;
}

void Relations::Equate(int target, int other) {
  if (!mStore[other].IsKnown()) return;
  const Sort from = mStore[other].Sort(), to = mStore[target].Sort();
  if (from == to) {
    mStore.StartOperation(Operation::Equal);
    mStore.Meet(target, mStore[other]);
  } else if (to == Sort::TextSet) {
    Value& outcome = mStore.Fresh(to);
    mStore.StartOperation(Operation::Equal);
    outcome.Text().CalcEqualValue(OperandFor(other, mOther).Any());
    mStore.Meet(target, outcome);
  } else {
    Value& outcome = mStore.CopyOf(target);
    mStore.StartOperation(Operation::InverseEqual);
    mStore[other].Text().CalcInverseEqualValue(outcome.Any());
    mStore.Meet(target, outcome);
  }
}

// Once the only text of one side is gone from the other, nothing is left to do.
Status Relations::Unequal(int x, int y) {
  if (mStore[y].IsOne()) Remove(x, mStore[y].LowestText());
  if (mStore.HasFailed()) return Status::Subsumed;
  if (mStore[x].IsOne()) Remove(y, mStore[x].LowestText());
  const bool isOne = mStore[x].IsOne() || mStore[y].IsOne();
  return isOne && mStore[x].IsKnown() && mStore[y].IsKnown() ? Status::Subsumed : Status::Fixpoint;
}

void Relations::Remove(int target, const ZORString& text) {
  if (!mStore[target].IsKnown()) return;
  mStore.StartOperation(Operation::Unequal);
  if (Lists(target, text)) mStore.Edit(target, [&](Value& value) { RemoveFrom(value, text); });
}

bool Relations::AreUnequal(const Constraint& constraint) {
  return constraint.kind->meaning == Meaning::Unequal && !constraint.kind->reified && !constraint.kind->IsOfNumbers();
}

bool Relations::CanRemove(int target, int unequal) {
  const Value& value = mStore[target];
  return value.Sort() == Sort::TextSet && value.IsKnown() && mStore[unequal].IsOne() &&
         Lists(target, mStore[unequal].LowestText());
}

void Relations::RemoveAll(int target, std::vector<ZORString> texts) {
  const ZORString last = texts.back();
  std::sort(texts.begin(), texts.end());
  std::vector<ZORString> kept;
  const std::vector<ZORString>& listed = mStore.List(target).texts;
  std::set_difference(listed.begin(), listed.end(), texts.begin(), texts.end(), std::back_inserter(kept));
  if (kept.empty()) kept.push_back(last);
  mStore.StartOperation(Operation::Unequal);
  mStore.MeetTexts(target, std::move(kept));
}

bool Relations::Lists(int variable, const ZORString& text) {
  const Value& value = mStore[variable];
  if (value.Sort() == Sort::Text) return value.LowestText() == text;
  mSingle.Text().SetExactValue(text);
  return value.Any().IsIntersected(mSingle.Any()) != 0;
}

// x <= y or x < y: x loses what is greater than all of y, and y what is less than all of x. A strict order is posted as
// less-or-equal and unequal, since the module compares only the upper bounds of sets.
Status Relations::Ordered(int x, int y, bool strict) {
  if (!mStore[x].IsKnown() || !mStore[y].IsKnown()) {
    if (strict) NarrowBeyondEnds(x, y);
    return Status::Fixpoint;
  }
  const Ends left = EndsOf(x), right = EndsOf(y);
  if (strict ? left.highest < right.lowest : left.highest <= right.lowest) return Status::Subsumed;
  CutAbove(x, left, right.highest, strict);
  if (!mStore.HasFailed()) CutBelow(y, right, left.lowest, strict);
  return Status::Fixpoint;
}

Relations::Ends Relations::EndsOf(int variable) const {
  return {mStore[variable].LowestText(), mStore[variable].HighestText()};
}

// No text is less than the least one, and none greater than the greatest.
void Relations::NarrowBeyondEnds(int x, int y) {
  if (mStore[y].IsKnown() && mStore[y].HighestText().GetLengthInChar() == 0) {
    mStore.StartOperation(Operation::LessOrEqual);
    mStore.Fail(x);
  } else if (mStore[x].IsKnown() && mStore[x].LowestText() == GreatestText()) {
    mStore.StartOperation(Operation::NotLess);
    mStore.Fail(y);
  } else {
    if (mStore[y].IsKnown() && mStore[y].LowestText().GetLengthInChar() == 0) Remove(y, ZORString());
    if (mStore[x].IsKnown() && mStore[x].HighestText() == GreatestText()) Remove(x, GreatestText());
  }
}

void Relations::CutAbove(int target, const Ends& ends, const ZORString& bound, bool strict) {
  if (strict ? ends.highest < bound : ends.highest <= bound) return;
  mStore.StartOperation(Operation::LessOrEqual);
  mStore.Edit(target, [&](Value& value) {
    if (bound < ends.lowest) return value.Any().SetNilValue();
    if (bound < ends.highest) value.Text().CalcLessOrEqualValue(Bound(bound).Any());
    if (strict) RemoveFrom(value, bound);
  });
}

// After CutAbove has left something to x, y has a text from bound on.
void Relations::CutBelow(int target, const Ends& ends, const ZORString& bound, bool strict) {
  if (strict ? ends.lowest > bound : ends.lowest >= bound) return;
  mStore.StartOperation(Operation::NotLess);
  mStore.Edit(target, [&](Value& value) {
    if (ends.lowest < bound) RaiseTo(LeastFrom(target, bound), value);
    if (strict) RemoveFrom(value, bound);
  });
}

// The least text of a set from bound on; there is one. A set does not answer its last text as the next one, but bound.
ZORString Relations::LeastFrom(int variable, const ZORString& bound) {
  const ZORString next = mStore[variable].Text().GetNextExactValue(bound);
  return next == bound && !Lists(variable, bound) ? mStore[variable].HighestText() : next;
}

// A listed one, since the module lists the bound.
void Relations::RaiseTo(const ZORString& bound, Value& value) {
  mSet.Text().SetExactValue(bound);
  value.Text().CalcNotLessValue(mSet.Text());
}

void Relations::RemoveFrom(Value& value, const ZORString& text) {
  mSingle.Text().SetExactValue(text);
  value.Text().CalcUnequalValue(mSingle.Any());
}

// An upper bound as an operand. One space goes into a set: as a single value it is the least of its class, which the
// module takes for the least of all.
Value& Relations::Bound(const ZORString& text) {
  Value& bound = text == " " ? mSet : mSingle;
  bound.Text().SetExactValue(text);
  return bound;
}

Status Relations::Decide(Meaning meaning, int x, int y, int truth) {
  mReified.Reset();
  if (x == y) {
    mStore.StartOperation(RelationOf(meaning));
    mReified.SetNumber(Semantics::Relates(meaning, ZORString(), ZORString()) ? 1 : 0);
  } else if (!Ask(meaning, x, y, mReified)) {
    return Status::Fixpoint;
  }
  mStore.Meet(truth, mReified);
  return mStore.HasCandidates(x) || mStore.HasCandidates(y) ? Status::Fixpoint : Status::Subsumed;
}

// False while the relation is open.
bool Relations::Ask(Meaning meaning, int x, int y, Value& answer) {
  if (!IsText(mStore[x].Sort())) return mNumbers.Ask(meaning, x, y, answer);
  if (!mStore[x].IsKnown() || !mStore[y].IsKnown()) return false;
  if (meaning != Meaning::Unequal) return AskTexts(meaning, x, y, answer);
  if (!AskTexts(Meaning::Equal, x, y, answer)) return false;
  answer.SetNumber(1 - answer.LowestNumber());
  return true;
}

// Where the module would judge least texts by their state, their texts decide.
bool Relations::AskTexts(Meaning meaning, int x, int y, Value& answer) {
  const Value& left = OperandFor(x, mSingle);
  const Value& right = OperandFor(y, mOther);
  mStore.StartOperation(RelationOf(meaning));
  if (meaning != Meaning::Equal) {
    AskOrder(meaning, left, right, answer);
  } else if (left.Sort() == Sort::Text) {  // a single value does not know what a set lists
    AskEqual(right, left, answer);
  } else {
    AskEqual(left, right, answer);
  }
  return answer.IsOne();
}

void Relations::AskEqual(const Value& left, const Value& right, Value& answer) {
  if (!TouchesLeast(left) && !TouchesLeast(right)) {
    left.Text().CalcIsEqual(right.Any(), answer.Boolean());
  } else if (left.Any().IsIntersected(right.Any()) == 0) {
    answer.SetNumber(0);
  } else if (left.IsOne() && right.IsOne()) {
    answer.SetNumber(1);
  }
}

void Relations::AskOrder(Meaning meaning, const Value& left, const Value& right, Value& answer) {
  if (!TouchesLeast(left) && !TouchesLeast(right)) {
    meaning == Meaning::Less ? left.Text().CalcIsLess(right.Text(), answer.Boolean())
                             : left.Text().CalcIsLessOrEqual(right.Any(), answer.Boolean());
  } else if (Semantics::Relates(meaning, left.HighestText(), right.LowestText())) {
    answer.SetNumber(1);
  } else if (!Semantics::Relates(meaning, left.LowestText(), right.HighestText())) {
    answer.SetNumber(0);
  }
}

// The variable's value; the greatest text as an Exact value, since the module judges Max by its state.
const Value& Relations::OperandFor(int variable, Value& plain) {
  const Value& value = mStore[variable];
  if (value.Sort() == Sort::TextSet || value.Text().IsFull() == 0) return value;
  plain.Text().SetExactValue(GreatestText());
  return plain;
}

}  // namespace zornet
