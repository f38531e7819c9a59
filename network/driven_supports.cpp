// Supports that are driven from the listed results of a concatenation, a slice, a minimum or a maximum.
#include <algorithm>
#include <limits>
#include <string_view>

#include "network/supports.h"

namespace zornet {

namespace {

constexpr double kNever = std::numeric_limits<double>::infinity();
constexpr std::size_t kMostParts = 1000;
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

bool IsExtreme(Meaning meaning) { return meaning == Meaning::Minimum || meaning == Meaning::Maximum; }

bool Has(const Listing& listing, std::string_view text) {
  const std::size_t i = LowerBound(listing, text);
  return i < listing.count && TextAt(listing, i) == text;
}

}  // namespace

// An estimate, to be compared with a number of combinations; infinity when it cannot be driven.
double Supports::DrivenCost(const Constraint& constraint) {
  const Meaning meaning = constraint.kind->meaning;
  const bool isExtreme = IsExtreme(meaning) && !constraint.kind->IsOfNumbers();
  if (meaning != Meaning::Concatenation && meaning != Meaning::Slice && !isExtreme) return kNever;
  const Column& result = Result();
  if (!result.IsListed()) return kNever;
  if (meaning == Meaning::Slice) {
    if (!At(0).IsListed() || !At(1).IsListed() || !At(2).IsListed()) return kNever;
    return static_cast<double>(At(0).listing->count) * static_cast<double>(At(1).listing->count) * kSearchCost;
  }
  if (constraint.Inputs() > kMostParts) return kNever;
  const bool isRepeated = mCount < constraint.arguments.size();
  if (isExtreme) {
    if (isRepeated || constraint.Inputs() < 2) return kNever;
    return static_cast<double>(result.listing->count) * static_cast<double>(constraint.Inputs()) * kSearchCost;
  }
  if (isRepeated && result.listing->texts.back() == GreatestText()) return kNever;
  return static_cast<double>(result.listing->count) * kSearchCost * static_cast<double>(constraint.Inputs() + 1) / 3;
}

// False when it takes more than the budget.
bool Supports::Drive(const Constraint& constraint) {
  Start();
  mTries = mBudget;
  mLeast = constraint.kind->meaning == Meaning::Minimum;
  if (IsExtreme(constraint.kind->meaning)) return DriveExtreme();
  return constraint.kind->meaning == Meaning::Slice ? DriveSlice() : DriveConcatenation();
}

bool Supports::Spend() {
  if (mTries == 0 || mStop.IsAsked()) return false;
  --mTries;
  return true;
}

bool Supports::DriveConcatenation() {
  const Listing& results = *Result().listing;
  const bool isRepeated = mCount < mColumnOf.size();
  for (std::size_t i = 0; i < results.count && !HasAll(); ++i) {
    if (!(isRepeated ? CutRepeated(i) : CutDifferent(i))) return false;
    if (results.texts[i] == GreatestText()) KeepOverflow(i);
  }
  return true;
}

// Keeps the ways to cut the result, where no input stands twice: what is reached from its beginning and leads to its
// end.
bool Supports::CutDifferent(std::size_t result) {
  const std::string_view text = TextAt(*Result().listing, result);
  if (!Reach(text)) return false;
  if (mReached.back()[text.size()] == 0) return true;
  Result().Keep(result);
  mLeads.assign(text.size() + 1, 0);
  mLeads.back() = 1;
  for (std::size_t input = Inputs(); input-- > 0;) {
    mLeadsNext.assign(text.size() + 1, 0);
    if (!(At(input).IsListed() ? KeepParts(input) : KeepUnknownParts(input, text))) return false;
    mLeads.swap(mLeadsNext);
  }
  return true;
}

// Finds from which places of the text each input can begin, when those before it are cut off.
bool Supports::Reach(std::string_view text) {
  mParts.clear();
  mReached.resize(Inputs() + 1);
  for (auto& places : mReached) places.assign(text.size() + 1, 0);
  mReached[0][0] = 1;
  for (std::size_t input = 0; input < Inputs(); ++input) {
    for (std::size_t from = 0; from <= text.size(); ++from) {
      if (mReached[input][from] == 0) continue;
      if (!At(input).IsListed()) {
        auto& next = mReached[input + 1];
        std::fill(next.begin() + static_cast<std::ptrdiff_t>(from), next.end(), 1);
        break;
      }
      if (!ReachFrom(input, text, from)) return false;
    }
  }
  return true;
}

bool Supports::ReachFrom(std::size_t input, std::string_view text, std::size_t from) {
  const Listing& listing = *At(input).listing;
  const std::string_view rest = text.substr(from);
  const auto add = [&](std::size_t i) {
    const std::size_t to = from + TextAt(listing, i).size();
    mParts.push_back({input, from, to, i});
    mReached[input + 1][to] = 1;
  };
  if (input + 1 == Inputs()) {
    const std::size_t i = LowerBound(listing, rest);
    if (i < listing.count && TextAt(listing, i) == rest) add(i);
    return Spend();
  }
  return ForEachBeginning(listing, rest, [&](bool begins, std::size_t i) {
    if (begins) add(i);
    return Spend();
  });
}

// From mLeads, the places that the next input can begin at, to mLeadsNext, those of this one.
bool Supports::KeepParts(std::size_t input) {
  for (; !mParts.empty() && mParts.back().input == input; mParts.pop_back()) {
    const Part& part = mParts.back();
    if (mLeads[part.to] == 0) continue;
    At(input).Keep(part.index);
    mLeadsNext[part.from] = 1;
  }
  return true;
}

bool Supports::KeepUnknownParts(std::size_t input, std::string_view text) {
  for (std::size_t from = 0; from <= text.size(); ++from) {
    if (mReached[input][from] == 0) continue;
    for (std::size_t to = from; to <= text.size(); ++to) {
      if (mLeads[to] == 0) continue;
      if (!Spend()) return false;
      mLeadsNext[from] = 1;
      At(input).found.push_back({ToZor(text.substr(from, to - from)), 0});
    }
  }
  return true;
}

// The same where an input stands twice or is the result: each way to cut is tried.
bool Supports::CutRepeated(std::size_t result) {
  const std::string_view text = TextAt(*Result().listing, result);
  mChosen.assign(mCount, {});
  mChosen[mColumnOf.back()] = {true, text, result};
  return CutFrom(0, text);
}

bool Supports::CutFrom(std::size_t input, std::string_view rest) {
  if (!Spend()) return false;
  if (input == Inputs()) {
    if (rest.empty()) KeepChosen();
    return true;
  }
  Choice& choice = mChosen[mColumnOf[input]];
  if (choice.made) return !rest.starts_with(choice.text) || CutFrom(input + 1, rest.substr(choice.text.size()));
  const auto choose = [&](std::size_t length, std::size_t i) {
    choice = {true, rest.substr(0, length), i};
    const bool goOn = CutFrom(input + 1, rest.substr(length));
    choice.made = false;
    return goOn;
  };
  if (At(input).IsListed()) {
    const Listing& listing = *At(input).listing;
    return ForEachBeginning(listing, rest, [&](bool begins, std::size_t i) {
      return begins ? choose(TextAt(listing, i).size(), i) : Spend();
    });
  }
  for (std::size_t length = 0; length <= rest.size(); ++length) {
    if (!choose(length, 0)) return false;
  }
  return true;
}

void Supports::KeepChosen() {
  for (std::size_t i = 0; i < mCount; ++i) {
    Column& column = mColumns[i];
    column.IsListed() ? column.Keep(mChosen[i].index) : column.found.push_back({ToZor(mChosen[i].text), 0});
  }
}

// The greatest text is also what every longer concatenation becomes.
void Supports::KeepOverflow(std::size_t greatest) {
  mLongest.clear();
  std::size_t longest = 0;
  for (std::size_t input = 0; input < Inputs(); ++input) {
    mLongest.push_back(At(input).IsListed() ? LongestOf(*At(input).listing) : kTextLimit);
    longest += mLongest.back();
  }
  if (longest <= kTextLimit) return;
  Result().Keep(greatest);
  for (std::size_t input = 0; input < Inputs(); ++input) {
    Column& column = At(input);
    column.open = !column.IsListed();
    const std::size_t others = longest - mLongest[input];
    for (std::size_t i = 0; column.IsListed() && i < column.listing->count; ++i) {
      if (TextAt(*column.listing, i).size() + others > kTextLimit) column.Keep(i);
    }
  }
}

// A result is had by an input, and every other input has something beyond it.
bool Supports::DriveExtreme() {
  const std::size_t results = Result().listing->count;
  mExtremes.clear();
  for (std::size_t i = 0; i < results; ++i) {
    if (!Attain(mLeast ? i : results - 1 - i)) return false;
  }
  for (const Extreme& extreme : mExtremes) Result().Keep(extreme.index);
  for (std::size_t input = 0; input < Inputs(); ++input) {
    At(input).open = !At(input).IsListed();
    if (At(input).IsListed()) KeepBesideExtreme(input);
  }
  return true;
}

bool Supports::Attain(std::size_t result) {
  const std::string_view text = TextAt(*Result().listing, result);
  std::size_t owner = 0, owners = 0;
  for (std::size_t input = 0; input < Inputs(); ++input) {
    if (!Spend()) return false;
    const Column& column = At(input);
    if (column.IsListed()) {
      const std::string_view last = TextAt(*column.listing, mLeast ? column.listing->count - 1 : 0);
      if (mLeast ? last < text : text < last) return true;  // this input is always nearer to the end
      if (!Has(*column.listing, text)) continue;
    }
    owner = input;
    ++owners;
  }
  if (owners > 0) mExtremes.push_back({result, owner, owners > 1});
  return true;
}

// Keeps what the input has as the extreme, or beyond one of another input.
void Supports::KeepBesideExtreme(std::size_t input) {
  Column& column = At(input);
  const Column& result = Result();
  const auto other = std::find_if(mExtremes.begin(), mExtremes.end(),
                                  [&](const Extreme& extreme) { return extreme.shared || extreme.owner != input; });
  for (std::size_t i = 0; i < column.listing->count; ++i) {
    const std::string_view text = TextAt(*column.listing, i);
    bool kept = false;
    if (other != mExtremes.end()) {
      const std::string_view extreme = TextAt(*result.listing, other->index);
      kept = mLeast ? extreme <= text : text <= extreme;
    }
    const std::size_t at = kept ? 0 : LowerBound(*result.listing, text);
    if (!kept && at < result.listing->count) kept = TextAt(*result.listing, at) == text && result.kept[at] != 0;
    if (kept) column.Keep(i);
  }
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
