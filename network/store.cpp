#include "network/store.h"

#include <algorithm>
#include <utility>

namespace zornet {

namespace {

Value Initial(const Types& types, const Variable& variable) {
  Value value(types, variable.sort);
  if (variable.texts.empty() && variable.numbers.empty()) return value;
  if (!IsText(variable.sort)) {
    value.SetNumbers(variable.numbers);
  } else if (variable.sort == Sort::Text) {
    value.SetText(ToZor(variable.texts.front()));
  } else {
    std::vector<ZORString> texts;
    texts.reserve(variable.texts.size());
    for (const std::string& text : variable.texts) texts.push_back(ToZor(text));
    value.SetTexts(texts);
  }
  return value;
}

}  // namespace

Store::Store(const zornet::Types& types, const zornet::Model& model) : mTypes(types), mModel(model) {
  mValues.reserve(model.Variables().size());
  for (const Variable& variable : model.Variables()) mValues.push_back(Initial(types, variable));
  for (int i = 0; i < kSorts; ++i) mFresh.emplace_back(types, static_cast<Sort>(i));
  mListings.resize(mValues.size());
  mListed.resize(mValues.size(), 0);
}

const Listing& Store::List(int variable) {
  const auto at = static_cast<std::size_t>(variable);
  Listing& listing = mListings[at];
  if (mListed[at] != 0) return listing;
  const Value& value = mValues[at];
  listing = Listing();
  listing.sort = value.Sort();
  listing.known = value.IsKnown() || (value.Sort() == Sort::Boolean && value.IsUndefined());
  mListed[at] = 1;
  if (!listing.known) return listing;
  if (IsText(value.Sort())) {
    listing.texts = value.Texts();
    listing.count = listing.texts.size();
  } else if (value.Sort() == Sort::IntegerSet) {
    listing.numbers = value.Numbers();
    listing.count = listing.numbers.size();
  } else {
    listing.first = value.LowestNumber();
    listing.count = static_cast<std::size_t>(std::int64_t{value.HighestNumber()} - listing.first + 1);
  }
  return listing;
}

Value& Store::Fresh(Sort sort) {
  Value& value = mFresh[static_cast<std::size_t>(sort)];
  value.Reset();
  return value;
}

Value& Store::CopyOf(int variable) {
  Value& value = mFresh[static_cast<std::size_t>((*this)[variable].Sort())];
  value.Any().Assign((*this)[variable].Any());
  return value;
}

void Store::StartOperation(Operation operation) {
  mOperation = operation;
  ++mCounts[static_cast<std::size_t>(operation)].calls;
}

Store::Measure Store::MeasureOf(const Value& value) {
  return {value.IsNil(), value.IsUndefined(), value.Any().GetCardinality()};
}

void Store::Meet(int variable, const Value& outcome) {
  Value& held = mValues[static_cast<std::size_t>(variable)];
  if (held.IsNil() || outcome.IsUndefined()) return;
  const Measure before = MeasureOf(held);
  const std::string shown = mWatcher != nullptr ? held.Show() : "";
  if (mMarks.empty()) {
    Narrow(variable, outcome);
  } else {
    Saved saved{variable, held};
    Narrow(variable, outcome);
    if (MeasureOf(held) != before) mTrail.push_back(std::move(saved));
  }
  if (MeasureOf(held) == before) return;
  OperationCounts& counts = mCounts[static_cast<std::size_t>(mOperation)];
  ++counts.changes;
  mListed[static_cast<std::size_t>(variable)] = 0;
  mTouched.push_back(variable);
  if (held.IsNil()) {
    ++counts.contradictions;
    mFailed = variable;
    mFailedConstraint = mConstraint;
  }
  if (mWatcher != nullptr)
    mWatcher->Narrowed({mConstraint, NameOf(mOperation), {variable}, shown, held.Show(), held.IsNil()});
}

// Intersecting a single value with the least or the greatest one would replace it, so disjoint values are found first.
void Store::Narrow(int variable, const Value& outcome) {
  Value& held = mValues[static_cast<std::size_t>(variable)];
  if (held.Any().IsIntersected(outcome.Any()) == 0) return held.Any().SetNilValue();
  held.Any().Intersect(outcome.Any());
  if (held.Sort() == Sort::Text && held.IsKnown() && held.LowestText() == GreatestText()) held.Text().CalcMaxValue();
}

// An unknown single number stays unknown unless one number is left.
void Store::Bound(int number, std::int64_t lowest, std::int64_t highest) {
  const Value& held = (*this)[number];
  if (held.IsNil()) return;
  lowest = std::max<std::int64_t>(lowest, held.LowestNumber());
  highest = std::min<std::int64_t>(highest, held.HighestNumber());
  if (lowest > highest) return Fail(number);
  if (lowest == held.LowestNumber() && highest == held.HighestNumber()) return;
  Value& range = Fresh(held.Sort() == Sort::Boolean ? Sort::Boolean : Sort::Interval);
  range.SetRange(static_cast<ZORLong>(lowest), static_cast<ZORLong>(highest));
  Meet(number, range);
}

void Store::Fail(int variable) {
  Value& nil = FreshLike(variable);
  nil.Any().SetNilValue();
  Meet(variable, nil);
}

void Store::Undo() {
  const std::size_t mark = mMarks.back();
  mMarks.pop_back();
  while (mTrail.size() > mark) {
    Saved& saved = mTrail.back();
    mListed[static_cast<std::size_t>(saved.variable)] = 0;
    mValues[static_cast<std::size_t>(saved.variable)] = std::move(saved.value);
    mTrail.pop_back();
  }
  mTouched.clear();
  mFailed = mFailedConstraint = kNone;
}

}  // namespace zornet
