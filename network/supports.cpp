#include "network/supports.h"

#include <algorithm>
#include <cmath>
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
  open = tooMany = met = false;
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

Supports::Supports(Store& store, Semantics& semantics, std::size_t budget, Stop& stop)
    : mStore(store),
      mSemantics(semantics),
      mBudget(budget),
      mStop(stop),
      mColumnOfVariable(store.Model().Variables().size(), 0) {}

bool Supports::Narrow(const Constraint& constraint) {
  Prepare(constraint);
  mTargets.clear();
  double beyond = std::numeric_limits<double>::infinity();
  for (std::size_t position = mForward + 1; position-- > 0;) {
    const bool forward = position == mForward;
    if (!forward && !Semantics::CanInvert(*constraint.kind, position)) continue;
    const double combinations = Combinations(constraint, position);
    if (combinations <= static_cast<double>(mBudget)) {
      mTargets.emplace_back(combinations * (forward ? 1 : kInversionCost), position);
    } else {
      beyond = std::min(beyond, combinations);
    }
  }
  std::sort(mTargets.begin(), mTargets.end(),
            [](const auto& a, const auto& b) { return a.first != b.first ? a.first < b.first : a.second > b.second; });
  const double driven = DrivenCost(constraint);
  const bool isDriven = !std::isinf(driven) && (mTargets.empty() || driven < mTargets.front().first);
  const auto reached = [&](const auto& target) { return Try(constraint, target.second); };
  if ((isDriven && Drive(constraint)) || std::any_of(mTargets.begin(), mTargets.end(), reached)) {
    Apply(constraint);
    return true;
  }
  if (mStop.WasAsked()) return false;
  if (isDriven || !std::isinf(beyond)) ExceedBudget(constraint, std::isinf(beyond) ? 0 : beyond);
  return false;
}

void Supports::ExceedBudget(const Constraint& constraint, double combinations) {
  constexpr double kMostCounted = 1e15;
  const auto count = static_cast<std::uint64_t>(combinations < kMostCounted ? combinations : 0);
  for (const int variable : constraint.arguments) {
    if (!mStore[variable].IsOne()) mStore.MeetLimit(Limit::Budget, variable, count, mBudget);
  }
}

void Supports::Prepare(const Constraint& constraint) {
  const std::size_t arity = constraint.arguments.size();
  for (Column* column : mTried) column->tried = false;
  mTried.clear();
  const bool posted = constraint.kind->IsRelation() && !constraint.kind->reified;
  mForward = posted ? arity : arity - 1;
  mCount = 0;
  mColumns.resize(std::max(mColumns.size(), arity));
  mColumnOf.resize(arity);
  mExact.resize(arity);
  for (std::size_t position = 0; position < arity; ++position) {
    const int variable = constraint.arguments[position];
    std::size_t column = mColumnOfVariable[static_cast<std::size_t>(variable)];
    if (column >= mCount || mColumns[column].variable != variable) {
      column = mCount++;
      mColumnOfVariable[static_cast<std::size_t>(variable)] = static_cast<std::uint32_t>(column);
      mColumns[column].variable = variable;
      mColumns[column].listing = &mStore.List(variable);
      mColumns[column].openBelow = mColumns[column].openAbove = false;
    }
    mColumnOf[position] = column;
    mExact[position] = {nullptr, 0, mStore[variable].Sort()};
  }
  if (constraint.kind->meaning == Meaning::Slice) ClampPositions();
}

// A slice begins inside the text or is empty, and all ends behind the text are alike. So even unknown positions have
// few candidates.
void Supports::ClampPositions() {
  const Listing& texts = *At(0).listing;
  const Listing& slices = *At(3).listing;
  if (!texts.known) return;
  std::int64_t last = 0;
  for (const ZORString& text : texts.texts) last = std::max<std::int64_t>(last, text.GetLengthInChar() - 1);
  if (!slices.known || slices.texts.front().GetLengthInChar() == 0) {
    ClampPosition(At(1), -1, last + 1, true, true);
    if (&At(1) != &At(2)) ClampPosition(At(2), -1, last, true, true);
  } else {
    ClampPosition(At(1), 0, last, false, false);
    if (&At(1) != &At(2)) ClampPosition(At(2), 0, last, false, true);
  }
}

// Where it is open, an end of the range stands for all that is beyond it too.
void Supports::ClampPosition(Column& column, std::int64_t low, std::int64_t high, bool openBelow, bool openAbove) {
  const Listing& listing = *column.listing;
  if (listing.sort == Sort::IntegerSet || (listing.known && listing.count == 1)) return;
  constexpr std::int64_t kLeast = std::numeric_limits<ZORLong>::min(), kMost = std::numeric_limits<ZORLong>::max();
  const std::int64_t from = listing.known ? listing.first : kLeast;
  const std::int64_t to = listing.known ? listing.first + static_cast<std::int64_t>(listing.count) - 1 : kMost;
  const std::int64_t first = std::max(openBelow ? std::min(low, to) : low, from);
  const std::int64_t last = std::min(openAbove ? std::max(high, from) : high, to);
  column.openBelow = openBelow && from < first;
  column.openAbove = openAbove && to > last;
  column.clamped = Listing();
  column.clamped.known = true;
  column.clamped.sort = Sort::Interval;
  column.clamped.first = static_cast<ZORLong>(first);
  column.clamped.count = static_cast<std::size_t>(std::max<std::int64_t>(last - first + 1, 0));
  if (mStore[column.variable].Sort() == Sort::Integer) {
    for (std::int64_t n = first; n <= last; ++n) column.clamped.numbers.push_back(static_cast<ZORLong>(n));
    column.clamped.sort = Sort::IntegerSet;  // a single one has each by itself
  }
  column.listing = &column.clamped;
}

// How many combinations of the other arguments there are; infinity when one of them is not listed.
double Supports::Combinations(const Constraint& constraint, std::size_t target) {
  for (Column* column : mTried) column->tried = false;
  mTried.clear();
  double combinations = 1;
  for (std::size_t position = 0; position < constraint.arguments.size(); ++position) {
    Column& column = At(position);
    if (position == target || column.tried) continue;
    if (!column.IsListed()) return std::numeric_limits<double>::infinity();
    combinations *= static_cast<double>(column.listing->count);
    column.tried = true;
    mTried.push_back(&column);
  }
  return combinations;
}

// False when a listed target has more supports than can be listed, or it is to end.
bool Supports::Try(const Constraint& constraint, std::size_t target) {
  const bool none = Combinations(constraint, target) == 0;
  Start();
  if (none) return true;
  for (Column* column : mTried) Choose(*column, 0);
  do {
    if (mStop.IsAsked() || !TryOne(constraint, target)) return false;
  } while (!HasAll() && Advance());
  return true;
}

void Supports::Start() {
  for (std::size_t i = 0; i < mCount; ++i) mColumns[i].Start();
}

bool Supports::TryOne(const Constraint& constraint, std::size_t target) {
  bool accepted = false;
  if (target == mExact.size()) {
    accepted = mSemantics.Holds(constraint, mExact);
  } else if (target == mForward) {
    Answer answer;
    accepted =
        mSemantics.Compute(constraint, std::span(mExact).first(target), answer) && Accept(target, std::move(answer));
  } else {
    auto answers = mSemantics.Invert(constraint, target, mExact);
    if (!answers && At(target).IsListed()) return false;
    if (!answers) {
      accepted = At(target).open = true;
      At(target).tooMany = At(target).tooMany || Semantics::IsManifold(*constraint.kind, target);
    }
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
bool Supports::Accept(std::size_t target, Answer&& answer) {
  Column& column = At(target);
  if (!column.IsListed()) {
    column.found.push_back(std::move(answer));
    return true;
  }
  const std::size_t index = Find(*column.listing, answer);
  if (index == column.listing->count) return false;
  if (column.tried) return index == column.index;
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
    IsText(column.listing->sort) ? mStore.KeepTexts(column.variable, column.kept) : MeetNumbers(column);
  }
}

void Supports::MeetNumbers(Column& column) {
  std::vector<ZORLong> numbers;
  if (column.IsRange())
    numbers = {column.listing->NumberAt(column.lowest), column.listing->NumberAt(column.behindHighest - 1)};
  for (std::size_t i = 0; i < column.kept.size(); ++i) {
    if (column.kept[i] != 0) numbers.push_back(column.listing->NumberAt(i));
  }
  const Value& held = mStore[column.variable];
  const bool above = column.openAbove && numbers.back() == column.listing->NumberAt(column.listing->count - 1);
  const bool below = column.openBelow && numbers.front() == column.listing->NumberAt(0);
  if (held.Sort() == Sort::Integer && (above || below)) return;
  if (above) numbers.back() = held.IsKnown() ? held.HighestNumber() : std::numeric_limits<ZORLong>::max();
  if (below) numbers.front() = held.IsKnown() ? held.LowestNumber() : std::numeric_limits<ZORLong>::min();
  mStore.MeetNumbers(column.variable, std::move(numbers));
}

void Supports::MeetFound(Column& column) {
  if (column.tooMany) mStore.ExceedSet(column.variable, 0);
  if (column.open) return;
  auto& found = column.found;
  std::sort(found.begin(), found.end(), IsBelow);
  found.erase(std::unique(found.begin(), found.end()), found.end());
  if (IsText(mStore[column.variable].Sort())) {
    if (found.size() > zor::kSetLimit) return mStore.ExceedSet(column.variable, found.size());
    std::vector<ZORString> texts;
    texts.reserve(found.size());
    for (Answer& answer : found) texts.push_back(std::move(answer.text));
    mStore.MeetTexts(column.variable, std::move(texts));
  } else {
    if (found.size() > ZORVadEnumInteger::kListLimit) return mStore.ExceedSet(column.variable, found.size());
    std::vector<ZORLong> numbers;
    numbers.reserve(found.size());
    for (const Answer& answer : found) numbers.push_back(answer.number);
    mStore.MeetNumbers(column.variable, std::move(numbers));
  }
}

}  // namespace zornet
