#include "network/store.h"

#include <algorithm>
#include <utility>

namespace zornet {

namespace {

// texts: room for those of the variable.
Value Initial(const Types& types, const Variable& variable, std::vector<ZORString>& texts) {
  Value value(types, variable.sort);
  if (variable.texts.empty() && variable.numbers.empty()) return value;
  if (!IsText(variable.sort)) {
    value.SetNumbers(variable.numbers);
  } else if (variable.sort == Sort::Text) {
    value.SetText(ToZor(variable.texts.front()));
  } else {
    texts.clear();
    for (const std::string& text : variable.texts) texts.push_back(ToZor(text));
    value.SetTexts(texts);
  }
  return value;
}

void KeepMarked(std::vector<ZORString>& texts, const std::vector<char>& marks) {
  std::size_t count = 0;
  for (std::size_t i = 0; i < texts.size(); ++i) {
    if (marks[i] != 0 && count++ != i) texts[count - 1] = std::move(texts[i]);
  }
  texts.resize(count);
}

}  // namespace

Store::Store(const zornet::Types& types, const zornet::Model& model) : mTypes(types), mModel(model) {
  mValues.reserve(model.Variables().size());
  std::vector<ZORString> texts;
  for (const Variable& variable : model.Variables()) mValues.push_back(Initial(types, variable, texts));
  mChanged.resize(mValues.size(), 0);
  for (int i = 0; i < kSorts; ++i) mFresh.emplace_back(types, static_cast<Sort>(i));
  mListings.resize(mValues.size());
  mListed.resize(mValues.size(), 0);
  mShapeOf.resize(mValues.size(), kNone);
}

const Listing& Store::List(int variable) {
  if (mListed[static_cast<std::size_t>(variable)] == 0) {
    Fill(variable, ListingOf(variable));
    Remember(variable);
  }
  return *mListings[static_cast<std::size_t>(variable)];
}

void Store::Fill(int variable, Listing& listing) const {
  const Value& value = (*this)[variable];
  listing.texts.clear();
  listing.numbers.clear();
  listing.first = 0;
  listing.count = 0;
  listing.sort = value.Sort();
  listing.known = value.IsKnown() || (value.Sort() == Sort::Boolean && value.IsUndefined());
  if (!listing.known) return;
  if (IsText(value.Sort())) {
    AddTexts(variable, listing.texts);
    listing.count = listing.texts.size();
  } else if (value.Sort() == Sort::IntegerSet) {
    listing.numbers = value.Numbers();
    listing.count = listing.numbers.size();
  } else {
    listing.first = value.LowestNumber();
    listing.count = static_cast<std::size_t>(std::int64_t{value.HighestNumber()} - listing.first + 1);
  }
}

// Where its listing is or will be.
Listing& Store::ListingOf(int variable) {
  std::unique_ptr<Listing>& held = mListings[static_cast<std::size_t>(variable)];
  if (held == nullptr && !mForgotten.empty()) {
    held = std::move(mForgotten.back());
    mForgotten.pop_back();
  }
  if (held == nullptr) held = std::make_unique<Listing>();
  return *held;
}

// The listing is good, until it is forgotten with all others.
void Store::Remember(int variable) {
  const Listing& listing = *mListings[static_cast<std::size_t>(variable)];
  mListed[static_cast<std::size_t>(variable)] = 1;
  mKept.push_back(variable);
  mKeptValues += 1 + listing.texts.size() + listing.numbers.size();
}

void Store::Hold(int variable, Listing listing) {
  ListingOf(variable) = std::move(listing);
  mListed[static_cast<std::size_t>(variable)] = 1;
}

// A large network would hold every value twice. Candidates are no copies. Small listings leave their memory to others.
void Store::ForgetListings() {
  constexpr std::size_t kMostRoom = 32;
  for (const int variable : mKept) {
    std::unique_ptr<Listing>& held = mListings[static_cast<std::size_t>(variable)];
    if (held == nullptr || HasCandidates(variable)) continue;
    if (held->texts.capacity() + held->numbers.capacity() <= kMostRoom) mForgotten.push_back(std::move(held));
    held.reset();
    mListed[static_cast<std::size_t>(variable)] = 0;
  }
  mKept.clear();
  mKeptValues = 0;
}

// As long as it is as it was declared, the model lists them at less cost.
void Store::AddTexts(int variable, std::vector<ZORString>& texts) const {
  const std::vector<std::string>& declared = Declared(variable).texts;
  if (mChanged[static_cast<std::size_t>(variable)] != 0 || declared.empty()) return (*this)[variable].AddTexts(texts);
  texts.reserve(declared.size());
  for (const std::string& text : declared) texts.push_back(ToZor(text));
}

std::size_t Store::Count(int variable) const {
  if (HasCandidates(variable)) return mListings[static_cast<std::size_t>(variable)]->count;
  const Value& value = (*this)[variable];
  const bool isListed = value.IsKnown() || (value.Sort() == Sort::Boolean && value.IsUndefined());
  return isListed ? value.Any().GetCardinality() : 0;
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
  if (Declared(variable).constant && !outcome.IsNil() && held.Any().IsIntersected(outcome.Any()) == 0)
    return Fail(variable);
  if (HasCandidates(variable) && !outcome.IsNil() && outcome.Sort() != held.Sort())
    return MeetNumbers(variable, CandidatesIn(variable, outcome));
  if (HasCandidates(variable) && !IsCandidate(variable, outcome)) return Fail(variable);
  Former former = FormerOf(variable);
  const bool wasUndefined = former.measure.undefined;
  Narrow(variable, outcome);
  if (Settle(std::move(former))) {
    if (wasUndefined) FitToShape(variable);
  } else if (wasUndefined && !outcome.IsNil()) {
    ExceedSet(variable, outcome.Any().GetCardinality());
  }
}

Store::Former Store::FormerOf(int variable) {
  const Value& held = (*this)[variable];
  Former former{variable, MeasureOf(held), mWatcher != nullptr ? Show(variable) : "", {}};
  if (!mMarks.empty()) former.saved = Saved{variable, held, TakeCandidates(variable)};  // which a value is less than
  return former;
}

bool Store::Settle(Former former) {
  if (MeasureOf((*this)[former.variable]) == former.measure) return false;
  if (former.saved) mTrail.push_back(std::move(*former.saved));
  mListed[static_cast<std::size_t>(former.variable)] = 0;
  Changed(former.variable, former.shown);
  return true;
}

void Store::Changed(int variable, const std::string& before) {
  const Value& held = (*this)[variable];
  OperationCounts& counts = mCounts[static_cast<std::size_t>(mOperation)];
  ++counts.changes;
  mTouched.push_back(variable);
  mChanged[static_cast<std::size_t>(variable)] = 1;
  if (held.IsNil()) {
    ++counts.contradictions;
    mFailed = variable;
    mFailedConstraint = mConstraint;
  }
  if (mWatcher != nullptr)
    mWatcher->Narrowed({mConstraint, NameOf(mOperation), {variable}, before, Show(variable), held.IsNil()});
}

// Intersecting a single value with the least or the greatest one would replace it, so disjoint values are found first.
void Store::Narrow(int variable, const Value& outcome) {
  Value& held = mValues[static_cast<std::size_t>(variable)];
  const bool areSets = held.Sort() == Sort::TextSet && outcome.Sort() == Sort::TextSet;
  if (!areSets && held.Any().IsIntersected(outcome.Any()) == 0) return held.Any().SetNilValue();
  held.Any().Intersect(outcome.Any());
  if (held.Sort() == Sort::Text && held.IsKnown() && held.LowestText() == GreatestText()) held.Text().CalcMaxValue();
}

// A single of which little enough is left gets candidates.
void Store::Bound(int variable, std::int64_t lowest, std::int64_t highest) {
  const Value& held = (*this)[variable];
  if (held.IsNil()) return;
  const std::int64_t from = LowestNumber(variable), to = HighestNumber(variable);
  lowest = std::max(lowest, from);
  highest = std::min(highest, to);
  if (lowest > highest) return Fail(variable);
  if (lowest == from && highest == to) return;
  Value& range = Fresh(held.Sort() == Sort::Boolean ? Sort::Boolean : Sort::Interval);
  range.SetRange(static_cast<ZORLong>(lowest), static_cast<ZORLong>(highest));
  const bool unlisted = held.Sort() == Sort::Integer && !HasCandidates(variable);
  if (!unlisted || lowest == highest) return Meet(variable, range);
  const auto count = static_cast<std::uint64_t>(highest - lowest + 1);
  if (count > MostListed(variable)) return ExceedSet(variable, count);
  MeetNumbers(variable, range.Numbers());
}

std::uint64_t Store::MostListed(int variable) const {
  return (*this)[variable].Sort() == Sort::IntegerSet ? ZORVadEnumInteger::kListLimit : zor::kSetLimit;
}

void Store::ExceedSet(int variable, std::uint64_t count) {
  const std::uint64_t most = MostListed(variable);
  if (count == 0 || count > most) MeetLimit(Limit::Set, variable, count, most);
}

// An interval is never narrowed again, which constraint ever is next.
void Store::MeetLimit(Limit limit, int variable, std::uint64_t count, std::uint64_t most) {
  const int until = limit == Limit::Narrowings ? kNone : mConstraint;
  mLimitsMet.try_emplace({until, variable, limit}, LimitMet{limit, {variable}, mConstraint, count, most});
}

void Store::ForgetLimits() {
  if (!mMarks.empty() || mConstraint == kNone) return;
  const auto first = mLimitsMet.lower_bound({mConstraint, 0, Limit()});
  mLimitsMet.erase(first, mLimitsMet.lower_bound({mConstraint + 1, 0, Limit()}));
}

std::vector<LimitMet> Store::LimitsMet() const {
  std::vector<LimitMet> met;
  met.reserve(mLimitsMet.size());
  for (const auto& each : mLimitsMet) met.push_back(each.second);
  return met;
}

std::int64_t Store::LowestNumber(int variable) const {
  if (HasCandidates(variable)) return mListings[static_cast<std::size_t>(variable)]->numbers.front();
  return (*this)[variable].LowestNumber();
}

std::int64_t Store::HighestNumber(int variable) const {
  if (HasCandidates(variable)) return mListings[static_cast<std::size_t>(variable)]->numbers.back();
  return (*this)[variable].HighestNumber();
}

bool Store::HasCandidates(int variable) const {
  const auto at = static_cast<std::size_t>(variable);
  const Sort sort = mValues[at].Sort();
  return (sort == Sort::Text || sort == Sort::Integer) && mListed[at] != 0 && mListings[at]->known &&
         mValues[at].IsUndefined();
}

bool Store::IsCandidate(int variable, const Value& outcome) const {
  if (outcome.IsNil()) return true;
  const Listing& candidates = *mListings[static_cast<std::size_t>(variable)];
  if (outcome.Sort() == Sort::Text)
    return std::binary_search(candidates.texts.begin(), candidates.texts.end(), outcome.LowestText());
  return std::binary_search(candidates.numbers.begin(), candidates.numbers.end(), outcome.LowestNumber());
}

// Of a single integer, by an outcome of another sort of integers.
std::vector<ZORLong> Store::CandidatesIn(int variable, const Value& outcome) const {
  std::vector<ZORLong> numbers = mListings[static_cast<std::size_t>(variable)]->numbers;
  std::erase_if(numbers, [&](ZORLong n) { return outcome.Integer().FindAtLeast(n) != n; });
  return numbers;
}

void Store::MeetTexts(int variable, std::vector<ZORString> texts) {
  if (texts.empty()) return Fail(variable);
  if (texts.size() > 1 && (*this)[variable].Sort() == Sort::Text)
    return MeetCandidates(variable, {true, std::move(texts), {}, 0, 0, Sort::Text});
  Value& outcome = FreshLike(variable);
  texts.size() == 1 ? outcome.SetText(texts.front()) : outcome.SetTexts(texts);
  const bool wasUndefined = (*this)[variable].IsUndefined();
  Meet(variable, outcome);
  if (!wasUndefined || mListed[static_cast<std::size_t>(variable)] != 0 || Count(variable) != texts.size()) return;
  const std::size_t count = texts.size();
  Hold(variable, {true, std::move(texts), {}, 0, count, (*this)[variable].Sort()});
  Remember(variable);
}

// A set loses the others in place, and so does its listing. A few go one by one, which is less work than a new set.
void Store::KeepTexts(int variable, const std::vector<char>& kept) {
  constexpr std::ptrdiff_t kFew = 16;
  Listing& listing = *mListings[static_cast<std::size_t>(variable)];
  if ((*this)[variable].Sort() != Sort::TextSet) {
    std::vector<ZORString> texts = listing.texts;
    KeepMarked(texts, kept);
    return MeetTexts(variable, std::move(texts));
  }
  Edit(variable, [&](Value& value) {
    const bool areFew = std::count(kept.begin(), kept.end(), 0) <= kFew;
    for (std::size_t i = kept.size(); areFew && i-- > 0;) {
      if (kept[i] == 0) value.Text().RemoveExactValue(listing.texts[i]);
    }
    KeepMarked(listing.texts, kept);
    if (!areFew) value.SetTexts(listing.texts);
  });
  listing.count = listing.texts.size();
  mListed[static_cast<std::size_t>(variable)] = 1;
}

void Store::MeetNumbers(int variable, std::vector<ZORLong> numbers) {
  if (numbers.empty()) return Fail(variable);
  if (numbers.size() > 1 && (*this)[variable].Sort() == Sort::Integer)
    return MeetCandidates(variable, {true, {}, std::move(numbers), 0, 0, Sort::IntegerSet});
  Value& outcome = FreshLike(variable);
  outcome.SetNumbers(numbers);
  Meet(variable, outcome);
}

// A value that is known must be one of them. New candidates are among the old ones.
void Store::MeetCandidates(int variable, Listing candidates) {
  const Listing& held = List(variable);
  if (held.known) {
    const auto lacks = [](const auto& values) {
      return [&](const auto& value) { return !std::binary_search(values.begin(), values.end(), value); };
    };
    std::erase_if(candidates.texts, lacks(held.texts));
    if (candidates.sort == Sort::IntegerSet && held.sort == Sort::IntegerSet)
      std::erase_if(candidates.numbers, lacks(held.numbers));
    if (held.sort == Sort::Integer) std::erase_if(candidates.numbers, [&](ZORLong n) { return n != held.first; });
  }
  candidates.count = candidates.texts.size() + candidates.numbers.size();
  if (held.known && candidates.count == held.count) return;
  if (candidates.count <= 1)
    return candidates.sort == Sort::Text ? MeetTexts(variable, std::move(candidates.texts))
                                         : MeetNumbers(variable, std::move(candidates.numbers));
  if (!held.known && candidates.count > MostListed(variable)) return ExceedSet(variable, candidates.count);
  const bool hadNone = !held.known;
  const std::string shown = mWatcher != nullptr ? Show(variable) : "";
  if (!mMarks.empty()) {
    Saved saved{variable, (*this)[variable], TakeCandidates(variable)};
    mTrail.push_back(std::move(saved));
  }
  Hold(variable, std::move(candidates));
  Changed(variable, shown);
  if (hadNone) FitToShape(variable);
}

const Shape* Store::HeldShape(int variable) const {
  const int shape = mShapeOf[static_cast<std::size_t>(variable)];
  return shape != kNone && !IsListed(variable) ? &mShapes[static_cast<std::size_t>(shape)] : nullptr;
}

Shape Store::ShapeOf(int variable) {
  if (const Shape* held = HeldShape(variable)) return *held;
  return IsListed(variable) ? Shape(List(variable).texts) : Shape();
}

// A shape that admits one text alone is its value.
void Store::MeetShape(int variable, const Shape& shape) {
  if (IsListed(variable)) {
    const Listing& listing = List(variable);
    std::vector<ZORString> texts;
    for (const ZORString& text : listing.texts) {
      if (shape.Admits(text.View())) texts.push_back(text);
    }
    if (texts.size() != listing.texts.size()) MeetTexts(variable, std::move(texts));
    return;
  }
  Shape met = ShapeOf(variable);
  met.Meet(shape);
  if (met.IsNothing()) return Fail(variable);
  if (const auto only = met.Only()) return MeetTexts(variable, {*only});
  if (const Shape* held = HeldShape(variable); held != nullptr ? met != *held : !met.IsAnything())
    HoldShape(variable, std::move(met));
}

void Store::HoldShape(int variable, Shape shape) {
  const std::string shown = mWatcher != nullptr ? Show(variable) : "";
  int& at = mShapeOf[static_cast<std::size_t>(variable)];
  if (at == kNone) {
    at = static_cast<int>(mShapes.size());
    mShapes.emplace_back();
  }
  Shape& held = mShapes[static_cast<std::size_t>(at)];
  if (!mMarks.empty()) mShapeTrail.emplace_back(variable, held);
  held = std::move(shape);
  Changed(variable, shown);
}

// What has become listed may be narrower than the shape it had, and wider.
void Store::FitToShape(int variable) {
  const int shape = mShapeOf[static_cast<std::size_t>(variable)];
  if (shape == kNone || HasFailed()) return;
  const std::size_t touched = mTouched.size();
  MeetShape(variable, mShapes[static_cast<std::size_t>(shape)]);
  mFitted = mFitted || mTouched.size() != touched;
}

// Null when there are none. Until they come back the listing is not to be read.
std::unique_ptr<Listing> Store::TakeCandidates(int variable) {
  if (!HasCandidates(variable)) return nullptr;
  return std::make_unique<Listing>(std::move(*mListings[static_cast<std::size_t>(variable)]));
}

std::string Store::Show(int variable) const {
  if (const Shape* shape = HeldShape(variable)) return (*this)[variable].Show() + ": " + Describe(*shape);
  if (!HasCandidates(variable)) return (*this)[variable].Show();
  const Listing& candidates = *mListings[static_cast<std::size_t>(variable)];
  Value all(mTypes, candidates.sort == Sort::Text ? Sort::TextSet : Sort::IntegerSet);
  candidates.sort == Sort::Text ? all.SetTexts(candidates.texts) : all.SetNumbers(candidates.numbers);
  return "one of " + all.Show();
}

// A contradiction shows in a variable rather than in a constant.
void Store::Fail(int variable) {
  if (Declared(variable).constant && mConstraint != kNone) {
    const auto arguments = mModel.Constraints()[static_cast<std::size_t>(mConstraint)].arguments;
    const auto found =
        std::find_if(arguments.rbegin(), arguments.rend(), [this](int other) { return !Declared(other).constant; });
    if (found != arguments.rend()) variable = *found;
  }
  Value& nil = FreshLike(variable);
  nil.Any().SetNilValue();
  Meet(variable, nil);
}

void Store::AddChanged(std::vector<int>& variables) const {
  for (std::size_t i = mMarks.back().values; i < mTrail.size(); ++i) variables.push_back(mTrail[i].variable);
}

void Store::Undo() {
  const Marked mark = mMarks.back();
  mMarks.pop_back();
  for (; mShapeTrail.size() > mark.shapes; mShapeTrail.pop_back()) {
    auto& [variable, shape] = mShapeTrail.back();
    mShapes[static_cast<std::size_t>(mShapeOf[static_cast<std::size_t>(variable)])] = std::move(shape);
  }
  while (mTrail.size() > mark.values) {
    Saved& saved = mTrail.back();
    const auto at = static_cast<std::size_t>(saved.variable);
    mListed[at] = 0;
    if (saved.candidates != nullptr) Hold(saved.variable, std::move(*saved.candidates));
    mValues[at] = std::move(saved.value);
    mTrail.pop_back();
  }
  mTouched.clear();
  mFailed = mFailedConstraint = kNone;
}

}  // namespace zornet
