// A second, slow account of the operations on sets of texts: a state and a sorted std::vector of std::string, operands
// passed as copies, texts compared and cut by the standard library. The target is the operand passed by reference.
#pragma once

#include <iterator>
#include <utility>

#include "tests/single/model.h"

namespace zor::test::model {

inline void Clear(Set& v, Tag tag) { v = Set{tag, {}}; }
inline int ToNil(Set& v) { return IsNil(v) ? 0 : (Clear(v, kNilTag), 1); }
inline int ToAny(Set& v) { return IsAny(v) ? 0 : (Clear(v, kAnyTag), 1); }
inline int ToMin(Set& v) { return IsMin(v) ? 0 : (v = "Min", 1); }
inline int ToMax(Set& v) { return IsMax(v) ? 0 : (v = "Max", 1); }
inline void NeverEmpty(Set& v) {
  if (v.tag == kExact && v.texts.empty()) v.tag = kNilTag;
}

// Texts one at a time.
inline int Contains(const Set& v, const std::string& s) {
  if (IsAny(v) || IsNil(v)) return 0;
  if (IsMax(v)) return -1;
  const auto place = std::find(v.texts.begin(), v.texts.end(), s);
  return place == v.texts.end() ? 0 : static_cast<int>(place - v.texts.begin()) + 1;
}
inline int Insert(Set& v, std::string s) {
  if (Contains(v, s) > 0) return 0;
  v.texts.insert(std::upper_bound(v.texts.begin(), v.texts.end(), s), s);
  return 1;
}
inline int SetExactValue(Set& v, std::string s) { return v = Set{kExact, {s}}, 0; }
inline int InsertExactValue(Set& v, std::string s) {
  if (IsAny(v) || IsMax(v)) return 0;
  if (v.texts.size() == 256) return Clear(v, kAnyTag), 0;
  Insert(v, s);
  return v.tag = kExact, 0;
}
inline int RemoveExactValue(Set& v, std::string s) {
  if (IsAny(v) || IsNil(v)) return 0;
  const auto place = std::find(v.texts.begin(), v.texts.end(), s);
  if (place == v.texts.end()) return 0;
  v.texts.erase(place);
  return NeverEmpty(v), 1;
}
inline int CutLower(Set& v, std::string s) {
  while (!v.texts.empty() && s > v.texts.front()) v.texts.erase(v.texts.begin());
  NeverEmpty(v);
  return static_cast<int>(v.texts.size());
}
inline int CutUpper(Set& v, std::string s) {
  if (s < kGreatestText) v.tag = kExact;
  while (!v.texts.empty() && v.texts.back() > s) v.texts.pop_back();
  NeverEmpty(v);
  return static_cast<int>(v.texts.size());
}
inline int SetLowerBound(Set& v, std::string s) {
  if (IsNil(v) || IsAny(v)) return 0;
  while (!v.texts.empty() && s >= v.texts.front()) v.texts.erase(v.texts.begin());
  return v.texts.insert(v.texts.begin(), s), 0;
}
inline int SetLowerBound(Str& v, std::string s) { return v = Text(s), 0; }
inline int SetUpperBound(Set& v, std::string s) {
  v.tag = s < kGreatestText ? kExact : kMaxTag;
  while (!v.texts.empty() && v.texts.back() >= s) v.texts.pop_back();
  return v.texts.push_back(s), 0;
}
inline std::string NextExactValue(const Set& v, std::string s) {
  const auto place = std::lower_bound(v.texts.begin(), v.texts.end(), s);
  return place == v.texts.end() || place + 1 == v.texts.end() ? s : *place;
}
inline std::string PrevExactValue(const Set& v, std::string s) {
  const auto place = std::upper_bound(v.texts.begin(), v.texts.end(), s);
  return place == v.texts.begin() || place == v.texts.end() ? s : *std::prev(place);
}

// Copies and sets.
inline int AppendTexts(Set& z, const std::vector<std::string>& texts) {
  int all = 1;
  for (const std::string& text : texts) all &= Insert(z, text);
  return all;
}
inline int Append(Set& z, Set x) { return x.texts.empty() ? 0 : AppendTexts(z, x.texts); }
inline int Copy(Set& z, Set x) { return z = Set{x.tag, {}}, Append(z, x); }
inline int Copy(Set& z, Str x) {
  z = Set{x.tag, {}};
  if (x.tag == kExact) z.texts = {x.text};
  return 1;
}
inline int Assign(Set& z, auto x) { return Copy(z, x), 1; }

inline int Walk(Set& z, const std::vector<std::string>& texts) {
  std::vector<std::string> common;
  std::set_intersection(z.texts.begin(), z.texts.end(), texts.begin(), texts.end(), std::back_inserter(common));
  if (common.size() == z.texts.size()) return 0;
  if (common.empty()) return ToNil(z);
  return z.texts = common, 1;
}
inline int IntersectTexts(Set& z, const std::vector<std::string>& texts) {
  if (IsNil(z)) return 0;
  if (!IsAny(z)) return Walk(z, texts);
  AppendTexts(z, texts);
  z.tag = kExact;
  return NeverEmpty(z), 1;
}
inline int Intersect(Set& z, Set x) {
  if (IsNil(z)) return 0;
  if (IsNil(x)) return ToNil(z);
  if (IsAny(x)) return 0;
  if (IsMax(z)) return x.tag == kMaxTag ? 0 : ToNil(z);
  if (IsAny(z)) return Copy(z, x), 1;
  return Walk(z, x.texts);
}
inline int Intersect(Set& z, Str x) {
  if (IsNil(z)) return 0;
  if (IsNil(x)) return ToNil(z);
  if (IsAny(x) || IsMax(x)) return 0;
  if (IsMax(z)) return ToNil(z);
  if (!IsAny(z) && Contains(z, x.text) == 0) return ToNil(z);
  return Copy(z, x);
}
inline int IntersectInverse(Set z, Str& x) {
  if (IsNil(x) || IsAny(z)) return 0;
  if (IsNil(z)) return ToNil(x);
  if (IsAny(x)) return z.texts.size() == 1 ? (x = Text(z.texts[0]), 1) : 0;
  return Contains(z, x.text) != 0 ? 0 : ToNil(x);
}
inline int CalcEqualValue(Set& z, auto x) { return Intersect(z, x); }
inline int CalcInverseEqualValue(Set z, Set& x) { return Intersect(x, z); }
inline int CalcInverseEqualValue(Set z, Str& x) { return IntersectInverse(z, x); }
inline int Join(Set& z, const Set& x) { return Append(z, x); }
inline int Join(Set& z, const Str& x) { return Insert(z, x.text); }
inline int Unite(Set& z, auto x) {
  if (IsAny(z)) return 0;
  if (IsAny(x)) return Clear(z, kAnyTag), 0;
  if (IsNil(x)) return 0;
  if (IsNil(z)) return Copy(z, x), 0;
  return Join(z, x), 0;
}
inline bool SharesText(const Set& z, const Str& x) { return Contains(z, x.text) != 0; }
inline bool SharesText(const Set& z, const Set& x) {
  return std::any_of(x.texts.begin(), x.texts.end(), [&](auto& text) { return Contains(z, text) != 0; });
}
inline int IsIntersected(Set z, auto x) {
  if (IsNil(z) || IsNil(x)) return 0;
  if (IsAny(z) || IsAny(x)) return 1;
  return IsMax(z) ? x.tag == kMaxTag : SharesText(z, x);
}
inline int CalcUnequalValue(Set& z, auto x) {
  if (IsNil(z) || IsAny(x)) return 0;
  if (IsNil(x)) return ToNil(z);
  return Lower(x) == Upper(x) ? RemoveExactValue(z, Lower(x)) : 0;
}
inline int CalcInverseUnequalValue(Set z, Set& x) { return CalcUnequalValue(x, z); }
inline int CalcInverseUnequalValue(Set z, Str& x) {
  if (IsNil(x) || IsAny(z)) return 0;
  if (IsNil(z)) return ToNil(x);
  return Lower(z) == Upper(z) && !IsAny(x) && x.text == Lower(z) ? ToNil(x) : 0;
}

// Relations into a Boolean.
inline int CalcIsEqual(Set z, auto x) {
  if (Known(z, x, false) != kOpen) return Known(z, x, false);
  if (IsMin(z) || IsMax(z) || IsMin(x) || IsMax(x) || IsIntersected(z, x) == 0) return kFalse;
  return Lower(z) == Upper(z) && Lower(z) == Lower(x) && Lower(z) == Upper(x) ? kTrue : kOpen;
}
inline int CalcIsLessOrEqual(Set z, auto x) { return CompareEnds(z, x, false); }
inline int CalcIsLess(Set z, auto x) { return CompareEnds(z, x, true); }

// Order.
inline int CalcLessOrEqualValue(Set& z, auto x) {
  if (IsNil(z) || IsNil(x)) return ToNil(z);
  if (IsAny(z) || IsAny(x)) return 0;
  if (IsMin(z)) return 0;
  if (IsMin(x)) return ToNil(z);
  if (IsMax(x)) return 0;
  if (IsMax(z) || Lower(z) > Upper(x)) return ToNil(z);
  return Upper(z) <= Upper(x) ? 0 : (CutUpper(z, Upper(x)), 1);
}
inline int CalcInverseLessOrEqualValue(Set z, auto& x) {
  if (IsNil(z) || IsNil(x)) return ToNil(x);
  if (IsAny(z) || IsAny(x)) return 0;
  return Lower(x) >= Lower(z) ? 0 : (SetLowerBound(x, Lower(z)), 1);
}
inline int CalcLessValue(Set& z, Set x) { return IsAny(z) || Upper(z) < Upper(x) ? 0 : ToNil(z); }
inline int CalcInverseLessValue(Set z, Set& x) { return IsAny(x) || Upper(z) < Upper(x) ? 0 : ToNil(x); }
inline int CalcNotLessValue(Set& z, Set x) { return CalcInverseLessOrEqualValue(x, z); }
inline int CalcInverseNotLessValue(Set z, Set& x) { return CalcLessOrEqualValue(x, z); }
inline int CalcNotLessAndUnequalValue(Set& z, Set x) { return CalcInverseLessValue(x, z); }
inline int CalcInverseNotLessAndUnequalValue(Set z, Set& x) { return CalcLessValue(x, z); }
inline int Test(const Set& z, Str& x, bool strict) {
  if (IsAny(x)) return 0;
  if (IsNil(z) || IsAny(z)) return IsNil(z) ? ToNil(x) : 0;  // of direct calls alone
  const std::string last = IsMax(z) ? kGreatestText : z.texts.back();
  return x.text > last || (strict && x.text == last) ? ToNil(x) : 0;
}
inline int CalcInverseNotLessValue(Set z, Str& x) { return Test(z, x, false); }
inline int CalcInverseNotLessAndUnequalValue(Set z, Str& x) { return Test(z, x, true); }

// Extremes.
inline int CalcMaxValue(Set& z, Set x, Set y) {
  if (IsNil(z) || IsNil(x) || IsNil(y)) return ToNil(z);
  if (IsMax(x) || IsMax(y)) return ToMax(z);
  if (IsAny(x) || IsAny(y)) return ToAny(z);
  z.tag = kExact;
  Append(z, x);
  Append(z, y);
  return SetLowerBound(z, std::max(Lower(x), Lower(y))), 1;
}
inline int CalcMinValue(Set& z, Set x, Set y) {
  if (IsNil(z) || IsNil(x) || IsNil(y)) return ToNil(z);
  if (IsAny(x)) return CalcLessOrEqualValue(z, y);
  if (IsAny(y)) return CalcLessOrEqualValue(z, x);
  if (IsMin(x) || IsMin(y)) return ToMin(z);
  if (IsMax(x) && IsMax(y)) return ToMax(z);
  z.tag = kExact;
  Append(z, x);
  Append(z, y);
  if (!IsMax(x) && !IsMax(y)) CutUpper(z, std::min(Upper(x), Upper(y)));
  return 1;
}
inline int CalcFirstInverseMaxValue(Set z, Set& x, Set y) {
  if (IsNil(z) || IsNil(x) || IsNil(y)) return ToNil(x);
  if (IsAny(z)) return ToAny(x);
  const bool attains = IsAny(y) || Lower(y) == Lower(z);
  if (IsAny(x)) return attains ? (Copy(x, z), 1) : 0;
  return !attains && Lower(x) < Lower(y) ? ToNil(x) : 0;
}
inline int CalcFirstInverseMinValue(Set z, Set& x, Set y) {
  if (IsNil(z) || IsNil(x) || IsNil(y)) return ToNil(x);
  if (IsAny(z)) return ToAny(x);
  const bool attains = IsAny(y) || Upper(y) == Upper(z);
  if (IsAny(x)) return attains ? (Copy(x, z), 1) : 0;
  return !attains && Upper(x) > Upper(y) ? ToNil(x) : 0;
}
inline int CalcNextValue(Set& z, Set x) {
  if (IsAny(x)) return 0;
  if (IsMax(x)) return ToMax(z);
  if (IsNil(z) || IsNil(x)) return ToNil(z);
  Clear(z, kExact);
  for (const std::string& text : x.texts) Insert(z, Next(text));
  return 1;
}
inline int CalcInverseNextValue(Set z, Set& x) {
  if (IsAny(z)) return ToAny(x);
  if (IsMin(z)) return ToMin(x);
  if (IsNil(z)) return ToNil(x);
  if (IsMax(z)) return x = Set{kMaxTag, {std::string(254, 'z') + 'y'}}, 1;
  Set previous{kExact, {}};
  for (const std::string& text : z.texts)
    if (!text.empty()) Insert(previous, text == kLeastText ? "" : Previous(text));
  return previous.texts.empty() ? ToNil(x) : (x = previous, 1);
}

// Concatenation and case.
inline int CalcConcatenation(Set& z, Set x, Set y) {
  if (IsNil(z) || IsNil(x) || IsNil(y)) return ToNil(z);
  if (IsAny(x) || IsAny(y)) return 0;
  if (IsMax(x) || IsMax(y)) return ToMax(z);
  Set sums{kNilTag, {}};
  for (const std::string& head : x.texts)
    for (const std::string& tail : y.texts) InsertExactValue(sums, head + tail);
  return Intersect(z, sums);
}
inline int CalcFirstInverseConcatenation(Set, Set&, Set) { return 0; }
inline int CalcSecondInverseConcatenation(Set, Set, Set&) { return 0; }

using Folding = std::string (*)(std::string);
inline int Settle(Set& z, const Set& x, Folding fold) {
  Set folds{kNilTag, {}};
  for (const std::string& text : x.texts) InsertExactValue(folds, fold(text));
  return Intersect(z, folds);
}
inline int Settle(Set& z, const Str& x, Folding fold) {
  if (IsMax(z)) return ToNil(z);
  if (IsAny(z)) return z = Set{kExact, {fold(x.text)}}, 1;
  return z.texts.front() == fold(x.text) ? 0 : ToNil(z);
}
inline int Fold(Set& z, const auto& x, Folding fold) {
  if (IsNil(z) || IsAny(x)) return 0;
  if (IsNil(x)) return ToNil(z);
  if (IsMin(x)) return IsMin(z) ? 0 : IsAny(z) ? ToMin(z) : ToNil(z);
  if (IsMax(x)) return IsMax(z) ? 0 : IsAny(z) ? ToMax(z) : ToNil(z);
  return Settle(z, x, fold);
}
inline std::vector<std::string> TextsOf(const Set& v) { return v.texts; }
inline std::vector<std::string> TextsOf(const Str& v) { return {v.text}; }
inline int InverseFold(const Set& z, auto& x, Folding fold) {
  if (IsAny(z)) return 0;
  if ((IsNil(z) && IsNil(x)) || (IsMin(z) && IsMin(x)) || (IsMax(z) && IsMax(x))) return 0;
  if (IsNil(z) || IsMin(z) || IsMax(z) || IsNil(x) || IsMin(x) || IsMax(x)) return ToNil(x);
  std::vector<std::string> folds = IsAny(x) ? z.texts : TextsOf(x);
  for (std::string& text : folds) text = fold(text);
  if (!IsAny(x)) return folds == z.texts ? 0 : ToNil(x);
  std::size_t own = 0;
  for (std::size_t i = 0; i < folds.size(); ++i) own += folds[i] == z.texts[i];
  return z.tag == kExact && own == 0 ? ToNil(x) : 0;
}
inline int CalcLowerValue(Set& z, auto x) { return Fold(z, x, Folded<'A', 'Z'>); }
inline int CalcUpperValue(Set& z, auto x) { return Fold(z, x, Folded<'a', 'z'>); }
inline int CalcInverseLowerValue(Set z, auto& x) { return InverseFold(z, x, Folded<'A', 'Z'>); }
inline int CalcInverseUpperValue(Set z, auto& x) { return InverseFold(z, x, Folded<'a', 'z'>); }

// Lengths, into and from a single integer.
inline int CalcLength(Set z, Int& n) {
  if (IsNil(z) || IsAny(z)) return n = Int(z.tag), 1;
  const auto has = [&](ZORLong length) {
    return std::any_of(z.texts.begin(), z.texts.end(),
                       [&](auto& t) { return static_cast<ZORLong>(t.size()) == length; });
  };
  const Int before = n;
  const Int first = z.texts.empty() ? Int(kNilTag) : Int(static_cast<ZORLong>(z.texts[0].size()));
  const bool one = std::all_of(z.texts.begin(), z.texts.end(), [&](auto& t) { return t.size() == z.texts[0].size(); });
  if (n.tag == kAnyTag && one) n = first;
  if (n.tag == kExact && !has(n.value)) n = Int(kNilTag);
  return n == before ? 0 : 1;
}
inline int CalcInverseLength(Set& z, Int n) {
  if (IsNil(z) || n.tag == kAnyTag) return 0;
  if (n.tag == kNilTag || (n.value < 0 && !IsAny(z))) return ToNil(z);
  if (IsAny(z)) return 0;
  std::erase_if(z.texts, [&](auto& text) { return static_cast<ZORLong>(text.size()) != n.value; });
  z.texts.erase(std::unique(z.texts.begin(), z.texts.end()), z.texts.end());
  z.tag = kExact;
  if (z.texts.size() > 256) Clear(z, kAnyTag);
  return NeverEmpty(z), 1;
}

// What an entry tests before it goes to the typed form.
template <class Target, class Body, class... Sources>
int Entry(Target& target, Body body, const Sources&... sources) {
  if (IsNil(target)) return 0;
  if ((IsNil(sources) || ...)) return ToNil(target);
  return (IsAny(sources) || ...) ? 0 : body();
}

}  // namespace zor::test::model
