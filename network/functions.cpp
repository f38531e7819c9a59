#include "network/functions.h"

#include <algorithm>
#include <limits>
#include <utility>

namespace zornet {

namespace {

Operation ForwardOf(Meaning meaning) {
  switch (meaning) {
    case Meaning::Concatenation:
      return Operation::Concatenation;
    case Meaning::Slice:
      return Operation::Slice;
    case Meaning::Length:
      return Operation::Length;
    case Meaning::Lower:
      return Operation::Lower;
    case Meaning::Upper:
      return Operation::Upper;
    case Meaning::Minimum:
      return Operation::Minimum;
    case Meaning::Maximum:
      return Operation::Maximum;
    case Meaning::Successor:
      return Operation::Successor;
    case Meaning::Sum:
      return Operation::Sum;
    case Meaning::Product:
      return Operation::Product;
    case Meaning::TextForm:
      return Operation::TextForm;
    default:
      return Operation::Supports;
  }
}

// Whether the module has an operation for it that takes sets.
bool TakesSets(Meaning meaning) {
  return meaning >= Meaning::Concatenation && meaning < Meaning::TextForm && meaning != Meaning::Slice;
}

// Whether it takes any number of inputs.
bool IsFold(Meaning meaning) {
  return meaning == Meaning::Concatenation || meaning == Meaning::Minimum || meaning == Meaning::Maximum;
}

constexpr std::int64_t kLastPosition = zor::kLengthLimit - 1;  // of a character in any text

std::int64_t ShortestOf(const Listing& listing) {
  std::int64_t shortest = zor::kLengthLimit;
  for (const ZORString& text : listing.texts) shortest = std::min<std::int64_t>(shortest, text.GetLengthInChar());
  return shortest;
}

std::int64_t LowestOr(const Value& number, std::int64_t unknown) {
  return number.IsKnown() ? number.LowestNumber() : unknown;
}

std::int64_t HighestOr(const Value& number, std::int64_t unknown) {
  return number.IsKnown() ? number.HighestNumber() : unknown;
}

std::size_t LongestOf(const Listing& listing) {
  std::size_t longest = 0;
  for (const ZORString& text : listing.texts) longest = std::max(longest, ToView(text).size());
  return longest;
}

}  // namespace

Functions::Functions(Store& store, std::size_t budget, Stop& stop)
    : mStore(store),
      mSemantics(store.Types()),
      mSupports(store, mSemantics, budget, stop),
      mArithmetic(store),
      mX(store.Types(), Sort::TextSet),
      mY(store.Types(), Sort::TextSet),
      mZ(store.Types(), Sort::TextSet) {}

// Inputs with one value each give the result by one forward operation. An Undefined result takes what the module makes
// of the sets of inputs. Everything else needs supports, or the module's sets again where these exceed the budget.
Status Functions::Narrow(const Constraint& constraint) {
  if (constraint.kind->IsRelation() && !constraint.kind->reified) return NarrowRelation(constraint);
  if (HasExact(constraint.arguments.first(constraint.Inputs()))) {
    ComputeExact(constraint);
    return Status::Subsumed;
  }
  if (constraint.kind->IsOfNumbers()) return NarrowNumbers(constraint);
  if (constraint.kind->meaning == Meaning::Length) BoundLength(constraint.Result());
  if (constraint.kind->meaning == Meaning::Position && !constraint.kind->reified) BoundPosition(constraint.Result());
  if (mStore.HasFailed()) return Status::Fixpoint;
  if (constraint.kind->meaning == Meaning::Successor && constraint.arguments[0] == constraint.Result()) {
    mStore.StartOperation(Operation::Successor);
    MeetResult(constraint, {GreatestText(), 0});  // the greatest text is its own successor
    return Status::Subsumed;
  }
  if (mStore.Count(constraint.Result()) == 0 && ComputeSets(constraint)) return Status::Fixpoint;
  if (mSupports.Narrow(constraint)) return Status::Fixpoint;
  if (constraint.kind->meaning == Meaning::Slice && BoundSlice(constraint)) return Status::Subsumed;
  if (mStore.HasFailed()) return Status::Fixpoint;
  ComputeSets(constraint);
  return Status::Again;  // the result may be an input too
}

// Bounds say all of intervals. Sets have holes beside, and what stands twice is bounded as if it were two.
Status Functions::NarrowNumbers(const Constraint& constraint) {
  const Status status = mArithmetic.Narrow(constraint);
  if (mStore.HasFailed() || status != Status::Again || !mArithmetic.NeedsSupports(constraint)) return status;
  if (mArithmetic.HasManyOpen(constraint)) {
    mSupports.ExceedBudget(constraint, 0);
    return status;
  }
  return mSupports.Narrow(constraint) ? Status::Fixpoint : Status::Again;
}

// Nothing is computed: the values that are left must be related.
Status Functions::NarrowRelation(const Constraint& constraint) {
  if (!HasExact(constraint.arguments)) {
    mSupports.Narrow(constraint);
    return Status::Fixpoint;
  }
  TakeExact(constraint.arguments);
  mStore.StartOperation(Operation::Supports);
  if (!mSemantics.Holds(constraint, mExact)) mStore.Fail(constraint.arguments.front());
  return Status::Subsumed;
}

bool Functions::HasExact(std::span<const int> variables) const {
  return std::all_of(variables.begin(), variables.end(), [this](int variable) { return mStore[variable].IsOne(); });
}

void Functions::TakeExact(std::span<const int> variables) {
  mExact.resize(variables.size());
  mTexts.resize(std::max(mTexts.size(), variables.size()));
  for (std::size_t i = 0; i < variables.size(); ++i) {
    const Value& value = mStore[variables[i]];
    if (IsText(value.Sort())) {
      mTexts[i] = value.LowestText();
      mExact[i] = {&mTexts[i], 0, value.Sort()};
    } else {
      mExact[i] = {nullptr, value.LowestNumber(), value.Sort()};
    }
  }
}

void Functions::ComputeExact(const Constraint& constraint) {
  TakeExact(constraint.arguments.first(constraint.Inputs()));
  const bool isExtreme = constraint.kind->IsOfNumbers() && constraint.kind->meaning != Meaning::Sum &&
                         constraint.kind->meaning != Meaning::Product;
  mStore.StartOperation(isExtreme ? Operation::Bounds : ForwardOf(constraint.kind->meaning));
  Answer answer;
  if (!mSemantics.Compute(constraint, mExact, answer)) return mStore.Fail(constraint.Result());
  MeetResult(constraint, answer);
}

void Functions::MeetResult(const Constraint& constraint, const Answer& answer) {
  Value& outcome = mStore.FreshLike(constraint.Result());
  if (IsText(outcome.Sort())) {
    outcome.SetText(answer.text);
  } else {
    outcome.SetNumber(answer.number);
  }
  mStore.Meet(constraint.Result(), outcome);
}

// False when the module has no such operation on sets, or when it would lose results.
bool Functions::ComputeSets(const Constraint& constraint) {
  const Meaning meaning = constraint.kind->meaning;
  if (!TakesSets(meaning) || !HasKnownInputs(constraint)) return false;
  const Value& first = AsSet(constraint.arguments[0], mX);
  if (meaning == Meaning::Length) {
    Value& lengths = mStore.FreshLike(constraint.Result());
    mStore.StartOperation(Operation::Length);
    first.Text().CalcLength(lengths.Integer());
    mStore.Meet(constraint.Result(), lengths);
    return true;
  }
  if (!(IsFold(meaning) ? FoldSets(constraint, first) : CallSets(meaning, first, first, mZ))) return false;
  if (mZ.IsUndefined()) return false;  // more texts than an operation on sets lists
  MeetSet(constraint.Result(), mZ);
  return true;
}

// Whether all are known and, since the module would pair different texts of one input too, none stands twice.
bool Functions::HasKnownInputs(const Constraint& constraint) {
  const auto inputs = constraint.arguments.first(constraint.Inputs());
  if (!std::all_of(inputs.begin(), inputs.end(), [this](int input) { return mStore[input].IsKnown(); })) return false;
  mInputs.assign(inputs.begin(), inputs.end());
  std::sort(mInputs.begin(), mInputs.end());
  return std::adjacent_find(mInputs.begin(), mInputs.end()) == mInputs.end();
}

// The sets of all inputs, one after another.
bool Functions::FoldSets(const Constraint& constraint, const Value& first) {
  const Meaning meaning = constraint.kind->meaning;
  if (meaning == Meaning::Concatenation && MayOverflow(constraint)) return false;
  if (constraint.Inputs() == 1) mZ.Any().Assign(first.Any());
  const Value* folded = &first;
  for (const int input : constraint.arguments.first(constraint.Inputs()).subspan(1)) {
    if (!CallSets(meaning, *folded, AsSet(input, mY), mZ)) return false;
    if (mZ.IsUndefined() || input == constraint.arguments[constraint.Inputs() - 1]) return true;
    std::swap(mX, mZ);
    folded = &mX;
  }
  return true;
}

bool Functions::CallSets(Meaning meaning, const Value& x, const Value& y, Value& result) {
  // The module takes one space for the lower bound of a set that lists "" alone, and would put it into the result.
  const bool leastBound = x.LowestText().GetLengthInChar() == 0 && y.LowestText().GetLengthInChar() == 0;
  if (meaning == Meaning::Maximum && leastBound) return false;
  mStore.StartOperation(ForwardOf(meaning));
  result.Reset();
  ZORVaDoString& z = result.Text();
  switch (meaning) {
    case Meaning::Concatenation:
      z.CalcConcatenation(x.Text(), y.Text());
      break;
    case Meaning::Lower:
      z.CalcLowerValue(x.Text());
      break;
    case Meaning::Upper:
      z.CalcUpperValue(x.Text());
      break;
    case Meaning::Minimum:
      z.CalcMinValue(x.Any(), y.Any());
      break;
    case Meaning::Maximum:
      z.CalcMaxValue(x.Any(), y.Any());
      break;
    default:
      z.CalcNextValue(x.Text());
      break;
  }
  return true;
}

// The module lists concatenations of any length in sets; here those above the limit are the greatest text.
bool Functions::MayOverflow(const Constraint& constraint) {
  std::size_t longest = 0;
  for (const int input : constraint.arguments.first(constraint.Inputs())) longest += LongestOf(mStore.List(input));
  return longest > kTextLimit;
}

const Value& Functions::AsSet(int variable, Value& set) {
  const Value& value = mStore[variable];
  if (value.Sort() == Sort::TextSet) return value;
  set.Text().SetExactValue(value.LowestText());
  return set;
}

void Functions::MeetSet(int variable, const Value& set) {
  if (mStore[variable].Sort() == Sort::TextSet) return mStore.Meet(variable, set);
  Value& outcome = mStore.CopyOf(variable);
  set.Text().CalcInverseEqualValue(outcome.Any());
  mStore.Meet(variable, outcome);
}

// Even the length of an unknown text lies within the limit.
void Functions::BoundLength(int number) {
  mStore.StartOperation(Operation::Length);
  mStore.Bound(number, 0, kTextLimit);
}

void Functions::BoundPosition(int number) {
  mStore.StartOperation(Operation::Supports);
  mStore.Bound(number, -1, kLastPosition);
}

// Narrows positions and slice by each other, whatever the text is. True when the slice must be empty.
bool Functions::BoundSlice(const Constraint& constraint) {
  const int from = constraint.arguments[1], to = constraint.arguments[2], slice = constraint.Result();
  const std::int64_t first = std::max<std::int64_t>(LowestOr(mStore[from], 0), 0);
  const std::int64_t last = HighestOr(mStore[to], kLastPosition);
  mStore.StartOperation(Operation::Slice);
  if (HighestOr(mStore[from], kLastPosition) < 0 || first > kLastPosition || last < first) {
    MeetResult(constraint, {});
    return true;
  }
  if (!mStore[slice].IsKnown()) return false;
  BoundPositions(from, to, ShortestOf(mStore.List(slice)));
  if (!mStore.HasFailed()) DropLongTexts(slice, last - first + 1);
  return false;
}

// A slice that is not empty begins inside the longest text, and ends so many characters later.
void Functions::BoundPositions(int from, int to, std::int64_t shortest) {
  if (shortest == 0) return;
  mStore.Bound(from, 0, std::min(HighestOr(mStore[to], kLastPosition), kLastPosition) - shortest + 1);
  if (mStore.HasFailed()) return;
  mStore.Bound(to, LowestOr(mStore[from], 0) + shortest - 1, std::numeric_limits<ZORLong>::max());
}

void Functions::DropLongTexts(int variable, std::int64_t longest) {
  const Listing& listing = mStore.List(variable);
  std::vector<ZORString> kept;
  for (const ZORString& text : listing.texts) {
    if (text.GetLengthInChar() <= longest) kept.push_back(text);
  }
  if (kept.size() == listing.count) return;
  if (kept.empty()) return mStore.Fail(variable);
  Value& outcome = mStore.FreshLike(variable);
  outcome.SetTexts(kept);
  mStore.Meet(variable, outcome);
}

}  // namespace zornet
