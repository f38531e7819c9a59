#include "network/arithmetic.h"

#include <algorithm>
#include <limits>
#include <tuple>

namespace zornet {

namespace {

constexpr std::int64_t kLeast = std::numeric_limits<ZORLong>::min();
constexpr std::int64_t kGreatest = std::numeric_limits<ZORLong>::max();
constexpr std::int64_t kBeyond = kGreatest + 2;  // no integer, nor its opposite
constexpr std::ptrdiff_t kMostOpen = 20;         // beyond, two numbers each are too many combinations

std::int64_t DivideDown(std::int64_t a, std::int64_t b) { return a / b - (a % b != 0 && (a < 0) != (b < 0) ? 1 : 0); }
std::int64_t DivideUp(std::int64_t a, std::int64_t b) { return -DivideDown(-a, b); }

}  // namespace

Status Arithmetic::Narrow(const Constraint& constraint) {
  switch (constraint.kind->meaning) {
    case Meaning::Sum:
      Sum(constraint);
      break;
    case Meaning::Product:
      Product(constraint.arguments[0], constraint.arguments[1], constraint.Result());
      break;
    default:
      Extreme(constraint);
      break;
  }
  return !mStore.HasFailed() && IsDecided(constraint) ? Status::Subsumed : Status::Again;
}

bool Arithmetic::NeedsSupports(const Constraint& constraint) const {
  const auto arguments = constraint.arguments;
  const auto hasHoles = [this](int variable) {
    const Value& value = mStore[variable];
    return mStore.HasCandidates(variable) || (value.Sort() == Sort::IntegerSet && value.IsKnown() && !value.IsOne());
  };
  if (std::any_of(arguments.begin(), arguments.end(), hasHoles)) return true;
  return arguments.size() == 3 &&
         (arguments[0] == arguments[1] || arguments[0] == arguments[2] || arguments[1] == arguments[2]);
}

bool Arithmetic::HasManyOpen(const Constraint& constraint) const {
  const auto isOpen = [this](int variable) { return !mStore[variable].IsOne(); };
  return std::count_if(constraint.arguments.begin(), constraint.arguments.end(), isOpen) > kMostOpen;
}

// Each term is what the others leave to nought.
void Arithmetic::Sum(const Constraint& constraint) {
  Collect(constraint);
  std::int64_t lowest = 0, highest = 0;
  for (const Term& term : mTerms) {
    lowest += term.lowest;
    highest += term.highest;
  }
  mStore.StartOperation(Operation::Sum);
  for (const Term& term : mTerms) {
    const std::int64_t least = term.highest - highest, most = term.lowest - lowest;
    const bool positive = term.factor > 0;
    Bound(term.variable,
          {DivideUp(positive ? least : most, term.factor), DivideDown(positive ? most : least, term.factor)});
    if (mStore.HasFailed()) return;
  }
}

void Arithmetic::Collect(const Constraint& constraint) {
  mTerms.clear();
  for (const int variable : constraint.arguments) mTerms.push_back({variable, 1});
  mTerms.back().factor = -1;
  std::sort(mTerms.begin(), mTerms.end(), [](const Term& a, const Term& b) { return a.variable < b.variable; });
  std::size_t count = 0;
  for (const Term& term : mTerms) {
    if (count != 0 && mTerms[count - 1].variable == term.variable) {
      mTerms[count - 1].factor += term.factor;
    } else {
      mTerms[count++] = term;
    }
  }
  mTerms.resize(count);
  std::erase_if(mTerms, [](const Term& term) { return term.factor == 0; });
  for (Term& term : mTerms) {
    const auto [lowest, highest] = RangeOf(term.variable);
    std::tie(term.lowest, term.highest) = std::minmax({term.factor * lowest, term.factor * highest});
  }
}

void Arithmetic::Product(int x, int y, int z) {
  mStore.StartOperation(Operation::Product);
  Bound(z, Multiply(RangeOf(x), RangeOf(y)));
  if (!mStore.HasFailed()) Bound(x, Divide(RangeOf(z), RangeOf(y)));
  if (!mStore.HasFailed()) Bound(y, Divide(RangeOf(z), RangeOf(x)));
}

Arithmetic::Range Arithmetic::Multiply(Range x, Range y) {
  const auto [lowest, highest] =
      std::minmax({x.lowest * y.lowest, x.lowest * y.highest, x.highest * y.lowest, x.highest * y.highest});
  return {lowest, highest};
}

// All x with x * y in z for a number of y.
Arithmetic::Range Arithmetic::Divide(Range z, Range y) {
  if (z.HasZero() && y.HasZero()) return {kLeast, kGreatest};
  if (y.lowest == 0 && y.highest == 0) return {1, 0};
  if (y.lowest == 0) ++y.lowest;
  if (y.highest == 0) --y.highest;
  if (y.HasZero()) {
    const std::int64_t farthest = std::max(-z.lowest, z.highest);
    return {-farthest, farthest};
  }
  Range x{std::numeric_limits<std::int64_t>::max(), std::numeric_limits<std::int64_t>::min()};
  for (const std::int64_t product : {z.lowest, z.highest}) {
    for (const std::int64_t divisor : {y.lowest, y.highest}) {
      x.lowest = std::min(x.lowest, DivideUp(product, divisor));
      x.highest = std::max(x.highest, DivideDown(product, divisor));
    }
  }
  return x;
}

// The greatest is the least of the opposites. Where one input alone can be the extreme, it is.
void Arithmetic::Extreme(const Constraint& constraint) {
  const bool opposite = constraint.kind->meaning == Meaning::Maximum;
  const auto turned = [&](Range range) { return opposite ? Range{-range.highest, -range.lowest} : range; };
  const auto inputs = constraint.arguments.first(constraint.Inputs());
  Range least{kBeyond, kBeyond};
  for (const int input : inputs) {
    const Range range = turned(RangeOf(input));
    least = {std::min(least.lowest, range.lowest), std::min(least.highest, range.highest)};
  }
  mStore.StartOperation(Operation::Bounds);
  Bound(constraint.Result(), turned(least));
  least = turned(RangeOf(constraint.Result()));
  int candidates = 0, candidate = constraint.Result();
  for (const int input : inputs) {
    if (mStore.HasFailed()) return;
    Bound(input, turned({least.lowest, kBeyond}));
    if (turned(RangeOf(input)).lowest > least.highest) continue;
    ++candidates;
    candidate = input;
  }
  if (mStore.HasFailed()) return;
  if (candidates == 0) return mStore.Fail(constraint.Result());
  if (candidates == 1) Bound(candidate, turned({-kBeyond, least.highest}));
}

// Whether what is known of the inputs gives the result, whatever the others are.
bool Arithmetic::IsDecided(const Constraint& constraint) const {
  const Meaning meaning = constraint.kind->meaning;
  const Value& result = mStore[constraint.Result()];
  if (meaning == Meaning::Sum || !result.IsOne()) return false;
  const ZORLong number = result.LowestNumber();
  if (meaning == Meaning::Product && number != 0) return false;
  const auto inputs = constraint.arguments.first(constraint.Inputs());
  const bool isThere = std::any_of(inputs.begin(), inputs.end(), [&](int input) {
    return mStore[input].IsOne() && mStore[input].LowestNumber() == number;
  });
  return isThere && std::all_of(inputs.begin(), inputs.end(), [&](int input) {
           if (meaning == Meaning::Minimum) return mStore[input].LowestNumber() >= number;
           return meaning == Meaning::Product || mStore[input].HighestNumber() <= number;
         });
}

}  // namespace zornet
