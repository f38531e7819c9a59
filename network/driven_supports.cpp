// Supports that are driven from the listed results of a concatenation or a slice.
#include <algorithm>
#include <limits>
#include <string_view>

#include "network/supports.h"

namespace zornet {

namespace {

constexpr double kNever = std::numeric_limits<double>::infinity();
constexpr double kSearchCost = 8;  // looking for the beginnings of a text costs about as much as so many combinations

std::string_view TextAt(const Listing& listing, std::size_t i) { return ToView(listing.texts[i]); }

// The first that is not less than text or number.
std::size_t LowerBound(const Listing& listing, std::string_view text) {
  const auto less = [](const ZORString& a, std::string_view b) { return ToView(a) < b; };
  return static_cast<std::size_t>(std::lower_bound(listing.texts.begin(), listing.texts.end(), text, less) -
                                  listing.texts.begin());
}

std::size_t LowerBound(const Listing& listing, std::int64_t number) {
  if (listing.sort == Sort::IntegerSet) {
    const auto& numbers = listing.numbers;
    return static_cast<std::size_t>(std::lower_bound(numbers.begin(), numbers.end(), number) - numbers.begin());
  }
  return static_cast<std::size_t>(
      std::clamp<std::int64_t>(number - listing.first, 0, static_cast<std::int64_t>(listing.count)));
}

std::size_t LongestOf(const Listing& listing) {
  std::size_t longest = 0;
  for (const ZORString& text : listing.texts) longest = std::max(longest, ToView(text).size());
  return longest;
}

std::size_t CommonLength(std::string_view a, std::string_view b) {
  return static_cast<std::size_t>(std::mismatch(a.begin(), a.end(), b.begin(), b.end()).first - a.begin());
}

// Visits the listed texts that text begins with, the longest first, until visit answers false. Each search finds one,
// or tells how much shorter the next one is at the least.
template <class Visit>
bool ForEachBeginning(const Listing& listing, std::string_view text, Visit visit) {
  std::size_t length = text.size();
  while (true) {
    const std::string_view most = text.substr(0, length);
    std::size_t i = LowerBound(listing, most);
    if (i == listing.count || TextAt(listing, i) != most) {
      if (i == 0) return true;
      --i;
    }
    const std::size_t common = CommonLength(TextAt(listing, i), most);
    const bool begins = common == TextAt(listing, i).size();
    if (!visit(begins, i)) return false;
    if (begins && common == 0) return true;
    length = begins ? common - 1 : common;
  }
}

}  // namespace

// An estimate, to be compared with a number of combinations; infinity when it cannot be driven.
double Supports::DrivenCost(const Constraint& constraint) {
  const Meaning meaning = constraint.kind->meaning;
  if (meaning != Meaning::Concatenation && meaning != Meaning::Slice) return kNever;
  if (meaning == Meaning::Concatenation && constraint.Inputs() != 2) return kNever;
  const Column &x = At(0), &y = At(1), &result = At(constraint.Inputs());
  if (!result.IsListed()) return kNever;
  if (meaning == Meaning::Slice) {
    if (!x.IsListed() || !y.IsListed() || !At(2).IsListed()) return kNever;
    return static_cast<double>(x.listing->count) * static_cast<double>(y.listing->count) * kSearchCost;
  }
  const bool isDoubled = &x == &y && !x.IsListed(), isRepeated = mCount < 3;
  if (!isDoubled && isRepeated && result.listing->texts.back() == GreatestText()) return kNever;
  if (!isDoubled && !x.IsListed() && !y.IsListed()) return kNever;
  return static_cast<double>(result.listing->count) * kSearchCost;
}

// False when it takes more than the budget.
bool Supports::Drive(const Constraint& constraint) {
  if (DrivenCost(constraint) == kNever) return false;
  Start();
  mTries = mBudget;
  return constraint.kind->meaning == Meaning::Slice ? DriveSlice() : DriveConcatenation();
}

bool Supports::Spend() {
  if (mTries == 0) return false;
  --mTries;
  return true;
}

bool Supports::DriveConcatenation() {
  const Listing& results = *At(2).listing;
  const bool isDoubled = &At(0) == &At(1) && !At(0).IsListed();
  for (std::size_t i = 0; i < results.count && !HasAll(); ++i) {
    if (!(isDoubled ? KeepDoubled(i) : Split(i))) return false;
    if (results.texts[i] == GreatestText()) KeepOverflow(i);
  }
  return true;
}

// Keeps the ways to cut the result in two: x begins it, y is the rest.
bool Supports::Split(std::size_t result) {
  const Column& x = At(0);
  const std::string_view text = TextAt(*At(2).listing, result);
  if (x.IsListed()) {
    return ForEachBeginning(*x.listing, text, [&](bool begins, std::size_t i) {
      if (!Spend()) return false;
      if (begins) KeepCut(result, TextAt(*x.listing, i).size(), i);
      return true;
    });
  }
  for (std::size_t length = 0; length <= text.size(); ++length) {
    if (!Spend()) return false;
    KeepCut(result, length, 0);
  }
  return true;
}

// Cuts the result behind so many characters, which are the text of x at i where x is listed.
void Supports::KeepCut(std::size_t result, std::size_t length, std::size_t i) {
  Column &x = At(0), &y = At(1), &z = At(2);
  const std::string_view text = TextAt(*z.listing, result), rest = text.substr(length);
  const std::size_t j = y.IsListed() ? LowerBound(*y.listing, rest) : 0;
  if (y.IsListed() && (j == y.listing->count || TextAt(*y.listing, j) != rest)) return;
  if ((&x == &z && i != result) || (&y == &z && j != result) || (&x == &y && i != j)) return;
  x.IsListed() ? x.Keep(i) : x.found.push_back({ToZor(text.substr(0, length)), 0});
  y.IsListed() ? y.Keep(j) : y.found.push_back({ToZor(rest), 0});
  z.Keep(result);
}

// Of one unknown text twice.
bool Supports::KeepDoubled(std::size_t result) {
  const std::string_view text = TextAt(*At(2).listing, result), half = text.substr(0, text.size() / 2);
  if (!Spend()) return false;
  if (half != text.substr(half.size())) return true;
  At(0).found.push_back({ToZor(half), 0});
  At(2).Keep(result);
  return true;
}

// The greatest text is also what every longer concatenation becomes.
void Supports::KeepOverflow(std::size_t greatest) {
  Column &x = At(0), &y = At(1);
  const std::size_t longestX = x.IsListed() ? LongestOf(*x.listing) : kTextLimit;
  const std::size_t longestY = y.IsListed() ? LongestOf(*y.listing) : kTextLimit;
  if (longestX + longestY <= kTextLimit) return;
  At(2).Keep(greatest);
  const auto keep = [](Column& column, std::size_t longestOther) {
    column.open = !column.IsListed();
    for (std::size_t i = 0; column.IsListed() && i < column.listing->count; ++i) {
      if (TextAt(*column.listing, i).size() + longestOther > kTextLimit) column.Keep(i);
    }
  };
  keep(x, longestY);
  keep(y, longestX);
}

bool Supports::DriveSlice() {
  const std::size_t texts = At(0).listing->count, positions = At(1).listing->count;
  for (std::size_t i = 0; i < texts && !HasAll(); ++i) {
    for (std::size_t from = 0; from < positions; ++from) {
      if (!Slice(i, from)) return false;
    }
  }
  return true;
}

// Keeps the slices of a text from one position on.
bool Supports::Slice(std::size_t text, std::size_t from) {
  const std::string_view whole = TextAt(*At(0).listing, text);
  const Listing& results = *At(3).listing;
  const std::int64_t begin = At(1).listing->NumberAt(from);
  const bool isOutside = begin < 0 || begin >= static_cast<std::int64_t>(whole.size());
  const std::size_t ends = At(2).listing->count;
  if (TextAt(results, 0).empty()) KeepSlice(text, from, 0, 0, isOutside ? ends : LowerBound(*At(2).listing, begin));
  if (isOutside) return Spend();
  const std::string_view rest = whole.substr(static_cast<std::size_t>(begin));
  return ForEachBeginning(results, rest, [&](bool begins, std::size_t i) {
    const std::size_t length = TextAt(results, i).size();
    if (!Spend()) return false;
    if (!begins || length == 0) return true;
    const std::int64_t end = begin + static_cast<std::int64_t>(length) - 1;
    const std::size_t first = LowerBound(*At(2).listing, end);
    KeepSlice(text, from, i, first, length == rest.size() ? ends : LowerBound(*At(2).listing, end + 1));
    return true;
  });
}

// With each end from first up to last, not including it.
void Supports::KeepSlice(std::size_t text, std::size_t from, std::size_t result, std::size_t first, std::size_t last) {
  Column &x = At(0), &begin = At(1), &end = At(2), &z = At(3);
  if (first >= last || (&x == &z && text != result)) return;
  if (&begin == &end && (from < first || from >= last)) return;
  x.Keep(text);
  begin.Keep(from);
  z.Keep(result);
  if (&begin == &end) return;
  if (end.IsRange()) {
    end.Keep(first);
    end.Keep(last - 1);
  } else {
    for (std::size_t i = first; i < last; ++i) end.Keep(i);
  }
}

}  // namespace zornet
