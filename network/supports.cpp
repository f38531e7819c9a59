#include "network/supports.h"

#include <algorithm>
#include <limits>
#include <utility>

namespace zornet {

namespace {

// Inverting a function costs about as much as computing it so many times.
constexpr double kInversionCost = 4;

bool IsBelow(const Answer& a, const Answer& b) { return a.number != b.number ? a.number < b.number : a.text < b.text; }

std::size_t Find(const Listing& listing, const Answer& answer) {
  if (IsText(listing.sort)) {
    const auto found = std::lower_bound(listing.texts.begin(), listing.texts.end(), answer.text);
    const bool there = found != listing.texts.end() && *found == answer.text;
    return there ? static_cast<std::size_t>(found - listing.texts.begin()) : listing.count;
  }
  if (listing.sort == Sort::IntegerSet) {
    const auto found = std::lower_bound(listing.numbers.begin(), listing.numbers.end(), answer.number);
    const bool there = found != listing.numbers.end() && *found == answer.number;
    return there ? static_cast<std::size_t>(found - listing.numbers.begin()) : listing.count;
  }
  const std::int64_t index = std::int64_t{answer.number} - listing.first;
  return index >= 0 && static_cast<std::size_t>(index) < listing.count ? static_cast<std::size_t>(index)
                                                                       : listing.count;
}

}  // namespace

bool Supports::Column::HasAll() const {
  return IsRange() ? lowest == 0 && behindHighest == listing->count : dropped == 0;
}

bool Supports::Column::HasNone() const { return IsRange() ? behindHighest == 0 : dropped == kept.size(); }

void Supports::Column::Start() {
  kept.assign(IsListed() && !IsRange() ? listing->count : 0, 0);
  dropped = kept.size();
  lowest = IsListed() ? listing->count : 0;
  behindHighest = 0;
  found.clear();
  open = met = false;
}

void Supports::Column::Keep(std::size_t place) {
  if (IsRange()) {
    lowest = std::min(lowest, place);
    behindHighest = std::max(behindHighest, place + 1);
  } else if (kept[place] == 0) {
    kept[place] = 1;
    --dropped;
  }
}

bool Supports::Narrow(const Constraint& constraint) {
  Prepare(constraint);
  mTargets.clear();
  for (std::size_t position = constraint.arguments.size(); position-- > 0;) {
    const bool result = position == constraint.Inputs();
    if (!result && !Semantics::CanInvert(*constraint.kind)) continue;
    const double combinations = Combinations(constraint, position);
    if (combinations <= static_cast<double>(mBudget)) {
      mTargets.emplace_back(combinations * (result ? 1 : kInversionCost), position);
    }
  }
  std::sort(mTargets.begin(), mTargets.end(),
            [](const auto& a, const auto& b) { return a.first != b.first ? a.first < b.first : a.second > b.second; });
  const double driven = DrivenCost(constraint);
  const bool isCheapest = mTargets.empty() || driven < mTargets.front().first;
  const auto reached = [&](const auto& target) { return Try(constraint, target.second); };
  if (!(isCheapest && Drive(constraint)) && std::none_of(mTargets.begin(), mTargets.end(), reached)) return false;
  Apply(constraint);
  return true;
}

void Supports::Prepare(const Constraint& constraint) {
  mCount = 0;
  const std::size_t arity = constraint.arguments.size();
  mColumns.resize(std::max(mColumns.size(), arity));
  mColumnOf.resize(arity);
  mExact.resize(arity);
  for (std::size_t at = 0; at < arity; ++at) {
    const int variable = constraint.arguments[at];
    std::size_t column = 0;
    while (column < mCount && mColumns[column].variable != variable) ++column;
    mColumnOf[at] = column;
    if (column == mCount) {
      ++mCount;
      mColumns[column].variable = variable;
      mColumns[column].listing = &mStore.List(variable);
      mColumns[column].openAbove = false;
    }
    mExact[at] = {nullptr, 0, mStore[variable].Sort()};
  }
  if (constraint.kind->meaning == Meaning::Slice) ClampPositions(constraint);
}

// A slice that is not empty begins inside the text, and all ends behind the text are alike. So even unknown positions
// have few candidates.
void Supports::ClampPositions(const Constraint& constraint) {
  const Listing& texts = *At(0).listing;
  const Listing& slices = *At(3).listing;
  if (!texts.known || !slices.known || slices.texts.front().GetLengthInChar() == 0) return;
  std::int64_t last = 0;
  for (const ZORString& text : texts.texts) last = std::max<std::int64_t>(last, text.GetLengthInChar() - 1);
  ClampPosition(At(1), last, false);
  if (constraint.arguments[1] != constraint.arguments[2]) ClampPosition(At(2), last, true);
}

void Supports::ClampPosition(Column& column, std::int64_t last, bool openAbove) {
  const Listing& listing = *column.listing;
  if (listing.sort == Sort::IntegerSet || (listing.known && listing.count == 1)) return;
  constexpr std::int64_t kGreatest = std::numeric_limits<ZORLong>::max();
  const std::int64_t from = listing.known ? std::max<std::int64_t>(listing.first, 0) : 0;
  const std::int64_t to = listing.known ? listing.first + static_cast<std::int64_t>(listing.count) - 1 : kGreatest;
  const std::int64_t top = openAbove ? std::max(last, from) : last;
  column.openAbove = openAbove && to > top;
  column.clamped = Listing();
  column.clamped.known = true;
  column.clamped.sort = Sort::Interval;
  column.clamped.first = static_cast<ZORLong>(from);
  column.clamped.count = static_cast<std::size_t>(std::max<std::int64_t>(std::min(to, top) - from + 1, 0));
  column.listing = &column.clamped;
}

// How many combinations of the other arguments there are; infinity when one of them is not listed.
double Supports::Combinations(const Constraint& constraint, std::size_t target) {
  mTried.clear();
  double combinations = 1;
  for (std::size_t position = 0; position < constraint.arguments.size(); ++position) {
    Column& column = At(position);
    if (position == target || IsTried(column)) continue;
    if (!column.IsListed()) return std::numeric_limits<double>::infinity();
    combinations *= static_cast<double>(column.listing->count);
    mTried.push_back(&column);
  }
  return combinations;
}

bool Supports::IsTried(const Column& column) const {
  return std::find(mTried.begin(), mTried.end(), &column) != mTried.end();
}

// False when a listed target has more supports than can be listed.
bool Supports::Try(const Constraint& constraint, std::size_t target) {
  const bool none = Combinations(constraint, target) == 0;
  Start();
  if (none) return true;
  for (Column* column : mTried) Choose(*column, 0);
  do {
    if (!TryOne(constraint, target)) return false;
  } while (!HasAll() && Advance());
  return true;
}

void Supports::Start() {
  for (std::size_t i = 0; i < mCount; ++i) mColumns[i].Start();
}

bool Supports::TryOne(const Constraint& constraint, std::size_t target) {
  bool accepted = false;
  if (target == constraint.Inputs()) {
    Answer answer;
    accepted = mSemantics.Compute(*constraint.kind, std::span(mExact).first(target), answer) &&
               Accept(target, std::move(answer));
  } else {
    auto answers = mSemantics.Invert(*constraint.kind, target, mExact);
    if (!answers && At(target).IsListed()) return false;
    if (!answers) accepted = At(target).open = true;
    if (answers) {
      for (Answer& answer : *answers) accepted = Accept(target, std::move(answer)) || accepted;
    }
  }
  if (!accepted) return true;
  for (Column* column : mTried) column->Keep(column->index);
  return true;
}

// The next combination; the last column turns fastest.
bool Supports::Advance() {
  for (auto column = mTried.rbegin(); column != mTried.rend(); ++column) {
    if ((*column)->index + 1 < (*column)->listing->count) {
      Choose(**column, (*column)->index + 1);
      return true;
    }
    Choose(**column, 0);
  }
  return false;
}

void Supports::Choose(Column& column, std::size_t index) {
  column.index = index;
  for (std::size_t position = 0; position < mExact.size(); ++position) {
    if (&At(position) != &column) continue;
    Exact& exact = mExact[position];
    if (IsText(column.listing->sort)) {
      exact.text = &column.listing->texts[index];
    } else {
      exact.number = column.listing->NumberAt(index);
    }
  }
}

// Whether the target can take answer; where this combination gave it a value, it must be that one.
bool Supports::Accept(std::size_t target, Answer answer) {
  Column& column = At(target);
  if (!column.IsListed()) {
    column.found.push_back(std::move(answer));
    return true;
  }
  const std::size_t index = Find(*column.listing, answer);
  if (index == column.listing->count) return false;
  if (IsTried(column)) return index == column.index;
  column.Keep(index);
  return true;
}

bool Supports::HasAll() const {
  return std::all_of(mColumns.begin(), mColumns.begin() + static_cast<std::ptrdiff_t>(mCount),
                     [](const Column& column) { return column.IsListed() && column.HasAll(); });
}

// A contradiction shows in a variable rather than a constant, and in the result rather than an input.
void Supports::Apply(const Constraint& constraint) {
  mStore.StartOperation(Operation::Supports);
  for (const bool constants : {false, true}) {
    for (std::size_t position = constraint.arguments.size(); position-- > 0;) {
      Column& column = At(position);
      if (mStore.HasFailed()) return;
      if (column.met || mStore.Declared(column.variable).constant != constants) continue;
      column.met = true;  // where it stands at another position too
      Meet(column);
    }
  }
}

void Supports::Meet(Column& column) {
  if (!column.IsListed()) {
    MeetFound(column);
  } else if (column.HasNone()) {
    mStore.Fail(column.variable);
  } else if (!column.HasAll() || column.listing == &column.clamped) {
    IsText(column.listing->sort) ? MeetTexts(column) : MeetNumbers(column);
  }
}

void Supports::MeetTexts(Column& column) {
  std::vector<ZORString> texts;
  for (std::size_t i = 0; i < column.kept.size(); ++i) {
    if (column.kept[i] != 0) texts.push_back(column.listing->texts[i]);
  }
  Value& outcome = mStore.FreshLike(column.variable);
  outcome.SetTexts(texts);
  mStore.Meet(column.variable, outcome);
}

void Supports::MeetNumbers(Column& column) {
  std::vector<ZORLong> numbers;
  if (column.IsRange())
    numbers = {column.listing->NumberAt(column.lowest), column.listing->NumberAt(column.behindHighest - 1)};
  for (std::size_t i = 0; i < column.kept.size(); ++i) {
    if (column.kept[i] != 0) numbers.push_back(column.listing->NumberAt(i));
  }
  const Value& held = mStore[column.variable];
  if (column.openAbove && column.behindHighest == column.listing->count)
    numbers.back() = held.IsKnown() ? held.HighestNumber() : std::numeric_limits<ZORLong>::max();
  Value& outcome = mStore.FreshLike(column.variable);
  outcome.SetNumbers(numbers);
  mStore.Meet(column.variable, outcome);
}

void Supports::MeetFound(Column& column) {
  if (column.open) return;
  auto& found = column.found;
  std::sort(found.begin(), found.end(), IsBelow);
  found.erase(std::unique(found.begin(), found.end()), found.end());
  const Sort sort = mStore[column.variable].Sort();
  if (found.empty()) return mStore.Fail(column.variable);
  if (IsInteger(sort)) return MeetFoundNumbers(column);
  if (found.size() > (sort == Sort::TextSet ? zor::kSetLimit : 1)) return;
  Value& outcome = mStore.Fresh(sort);
  if (sort == Sort::TextSet) {
    std::vector<ZORString> texts;
    texts.reserve(found.size());
    for (Answer& answer : found) texts.push_back(std::move(answer.text));
    outcome.SetTexts(texts);
  } else {
    outcome.SetText(found.front().text);
  }
  mStore.Meet(column.variable, outcome);
}

// A set that cannot list them all stays unknown, as does a single that could be several.
void Supports::MeetFoundNumbers(const Column& column) {
  Value& outcome = mStore.FreshLike(column.variable);
  if (outcome.Sort() == Sort::IntegerSet && column.found.size() > ZORVadEnumInteger::kListLimit) return;
  std::vector<ZORLong> numbers;
  numbers.reserve(column.found.size());
  for (const Answer& answer : column.found) numbers.push_back(answer.number);
  outcome.SetNumbers(numbers);
  mStore.Meet(column.variable, outcome);
}

}  // namespace zornet
