// A second, slow account of the operations on single strings: a state and a std::string, operands passed as copies,
// texts compared and cut by the standard library. The target is the operand passed by reference.
#pragma once

#include <algorithm>
#include <climits>
#include <cstdint>
#include <string>
#include <string_view>

#include "tests/support/beside.h"

namespace zor::test::model {

inline int Put(Str& t, const Str& value) { return t = value, 1; }
inline int ToNil(Str& t) { return IsNil(t) ? 0 : Put(t, kNil); }
inline int ToAny(Str& t) { return IsAny(t) ? 0 : Put(t, kAny); }
inline int ToMin(Str& t) { return IsMin(t) ? 0 : Put(t, kMin); }
inline int ToMax(Str& t) { return IsMax(t) ? 0 : Put(t, kMax); }
inline int Settle(Str& t, const std::string& c) {
  if (IsAny(t)) return Put(t, Text(c));
  return t.text == c ? 0 : ToNil(t);
}

// States and sets.
inline int Assign(Str& z, Str x) { return IsNil(x) || IsAny(x) ? (z.tag = x.tag, 1) : (z = x, 1); }
inline int IsIntersected(Str& z, Str x) {
  if (IsNil(z) || IsNil(x)) return 0;
  return IsAny(z) || IsAny(x) || z.text == x.text;
}
inline int CalcEqualValue(Str& z, Str x) {
  if (IsNil(z) || IsAny(x)) return 0;
  if (IsNil(x)) return ToNil(z);
  if (IsMin(x)) return ToMin(z);
  if (IsMax(x)) return ToMax(z);
  return Settle(z, x.text);
}
inline int CalcInverseEqualValue(Str z, Str& x) { return CalcEqualValue(x, z); }
inline int Intersect(Str& z, Str x) { return CalcEqualValue(z, x); }
inline int Unite(Str& z, Str x) {
  if (IsAny(z)) return 0;
  if (IsAny(x)) return ToAny(z), 0;
  if (IsNil(x) || (IsMin(z) && IsMin(x)) || (IsMax(z) && IsMax(x))) return 0;
  if (IsMin(z) || IsMax(z) || IsMin(x) || IsMax(x)) return ToAny(z), 0;
  if (IsNil(z)) return z = Text(x.text), 0;
  return z.text == x.text ? 0 : (ToAny(z), 0);
}
inline int CalcUnequalValue(Str& z, Str x) {
  if (IsNil(z) || IsAny(x)) return 0;
  if (IsNil(x)) return ToNil(z);
  return IsAny(z) || z.text != x.text ? 0 : ToNil(z);
}
inline int CalcInverseUnequalValue(Str z, Str& x) { return CalcUnequalValue(x, z); }

// Relations into a Boolean, of singles and of sets.
int Known(const auto& z, const auto& x, bool strict) {
  if (IsAny(z) || IsAny(x)) return kUndefined;
  if (IsNil(z) || IsNil(x)) return kContradiction;
  if ((IsMin(z) && IsMin(x)) || (IsMax(z) && IsMax(x))) return strict ? kFalse : kTrue;
  return kOpen;
}
int CompareEnds(const auto& z, const auto& x, bool strict) {
  if (Known(z, x, strict) != kOpen) return Known(z, x, strict);
  if (IsMax(x) || IsMin(z)) return kTrue;
  if (IsMax(z) || IsMin(x)) return kFalse;
  if (Upper(z) < Lower(x) || (!strict && Upper(z) == Lower(x))) return kTrue;
  return Lower(z) > Upper(x) || (strict && Lower(z) == Upper(x)) ? kFalse : kOpen;
}
inline int CalcIsEqual(Str z, Str x) {
  const int known = Known(z, x, false);
  if (known != kOpen || IsMin(z) || IsMax(z) || IsMin(x) || IsMax(x)) return known == kOpen ? kFalse : known;
  return z.text == x.text ? kTrue : kFalse;
}
inline int CalcIsLessOrEqual(Str z, Str x) { return CompareEnds(z, x, false); }
inline int CalcIsLess(Str z, Str x) { return CompareEnds(z, x, true); }

// Order. t is one of a and b, as it was.
inline int Less(Str a, Str b, Str& t) {
  if (IsNil(a) || IsNil(b)) return ToNil(t);
  if (IsAny(a) || IsAny(b)) return 0;
  if (IsMax(a) || IsMin(b)) return ToNil(t);
  if (IsMin(a) || IsMax(b)) return 0;
  return a.text < b.text ? 0 : ToNil(t);
}
inline int LessOrEqual(Str a, Str b, Str& t) {
  if (IsNil(a) || IsNil(b)) return ToNil(t);
  if (IsAny(a) || IsAny(b)) return 0;
  if (IsMin(a) || IsMax(b)) return 0;
  if (IsMax(a) || IsMin(b)) return ToNil(t);
  return a.text <= b.text ? 0 : ToNil(t);
}
inline int CalcLessValue(Str& z, Str x) { return Less(z, x, z); }
inline int CalcInverseLessValue(Str z, Str& x) { return Less(z, x, x); }
inline int CalcLessOrEqualValue(Str& z, Str x) { return LessOrEqual(z, x, z); }
inline int CalcInverseLessOrEqualValue(Str z, Str& x) { return LessOrEqual(z, x, x); }
inline int CalcNotLessValue(Str& z, Str x) { return LessOrEqual(x, z, z); }
inline int CalcInverseNotLessValue(Str z, Str& x) { return LessOrEqual(x, z, x); }
inline int CalcNotLessAndUnequalValue(Str& z, Str x) { return Less(x, z, z); }
inline int CalcInverseNotLessAndUnequalValue(Str z, Str& x) { return Less(x, z, x); }

// Extremes.
inline int CalcMaxValue(Str& z, Str x, Str y) {
  if (IsNil(x) || IsNil(y)) return ToNil(z);
  if (IsAny(x) || IsAny(y)) return ToAny(z);
  if (IsMax(x) || IsMax(y)) return !IsMax(z) && !IsAny(z) ? ToNil(z) : ToMax(z);
  return Settle(z, std::max(x.text, y.text));
}
inline int CalcMinValue(Str& z, Str x, Str y) {
  if (IsNil(x) || IsNil(y)) return ToNil(z);
  if (IsAny(x) || IsAny(y)) return ToAny(z);
  if (IsMin(x) || IsMin(y)) return !IsMin(z) && !IsAny(z) ? ToNil(z) : ToMin(z);
  if (IsMax(x) && IsMax(y)) return ToMax(z);
  if (IsMax(x) || IsMax(y)) return Settle(z, IsMax(x) ? y.text : x.text);
  return Settle(z, std::min(x.text, y.text));
}
inline int CalcFirstInverseMaxValue(Str z, Str& x, Str y) {
  if ((IsAny(z) && IsAny(x)) || IsAny(y) || IsNil(x)) return 0;
  if (IsNil(z) || IsNil(y)) return ToNil(x);
  if (IsAny(z)) return ToAny(x);
  if (IsAny(x)) {
    if (IsMax(z)) return ToMax(x);
    if (IsMin(z) || z.text < y.text) return ToNil(x);
    return z.text == y.text ? 0 : Put(x, z);
  }
  if (y.text <= x.text && z.text == x.text) return 0;
  return x.text < y.text && z.text == y.text ? 0 : ToNil(x);
}
inline int CalcFirstInverseMinValue(Str z, Str& x, Str y) {
  if ((IsAny(z) && IsAny(x)) || IsAny(y) || IsNil(x)) return 0;
  if (IsNil(z) || IsNil(y)) return ToNil(x);
  if (IsAny(z)) return ToAny(x);
  if (IsAny(x)) return IsMax(z) || z.text > y.text ? ToNil(x) : Put(x, z);
  if (x.text <= y.text && z.text == x.text) return 0;
  return y.text < x.text && z.text == y.text ? 0 : ToNil(x);
}
inline int CalcNextValue(Str& z, Str x) {
  if (IsAny(x)) return 0;
  if (IsMax(x) || IsNil(x)) return ToNil(z);
  if (Next(x.text) != x.text) return Settle(z, Next(x.text));
  return IsAny(z) ? ToMax(z) : z.text == x.text ? 0 : ToNil(z);
}
inline int CalcInverseNextValue(Str z, Str& x) {
  if (IsAny(z)) return 0;
  if (IsMin(z) || IsNil(z) || z.text.empty()) return ToNil(x);
  return Settle(x, Previous(z.text));
}

// Concatenation and substring.
inline int CalcConcatenation(Str& z, Str x, Str y) {
  if (IsNil(z) || IsNil(x) || IsNil(y)) return ToNil(z);
  if (IsAny(x) || IsAny(y)) return ToAny(z);
  if (IsMax(x) || IsMax(y) || (x.text + y.text).size() > 255) return ToMax(z);
  return Settle(z, x.text + y.text);
}
inline int CalcFirstInverseConcatenation(Str z, Str& x, Str y) {
  if (IsNil(x)) return 0;
  if (IsNil(z) || IsNil(y)) return ToNil(x);
  if (IsAny(z) || IsAny(y) || IsMax(y) || IsMax(z)) return ToAny(x);
  const std::size_t p = z.text.find(y.text);
  return p == std::string::npos ? ToNil(x) : Settle(x, z.text.substr(0, p));
}
inline int CalcSecondInverseConcatenation(Str z, Str x, Str& y) {
  if (IsNil(y)) return 0;
  if (IsNil(z) || IsNil(x)) return ToNil(y);
  if (IsAny(z) || IsAny(x) || IsMax(x) || IsMax(z)) return ToAny(y);
  return z.text.find(x.text) == std::string::npos ? ToNil(y) : Settle(y, z.text.substr(x.text.size()));
}
inline ZORLong Wrap(std::int64_t n) { return static_cast<ZORLong>(static_cast<std::uint32_t>(n)); }
inline std::string Sub(const std::string& t, ZORLong start, ZORLong count) {
  if (start < 0 || start >= static_cast<ZORLong>(t.size()) || count < 0) return "";
  return t.substr(start, count);
}
inline std::string Slice(const Str& v, const Int& start, const Int& end) {
  return Sub(v.text, start.value, Wrap(std::int64_t{end.value} + 1 - start.value));
}
inline bool OneIs(Tag tag, const Int& a, const Int& b) { return a.tag == tag || b.tag == tag; }
inline int CalcSubString(Str& z, Str x, Int start, Int end) {
  if (IsNil(x)) return ToNil(z);
  if (IsAny(x)) return ToAny(z);
  if (IsMin(x)) return ToMin(z);
  if (OneIs(kNilTag, start, end)) return ToNil(z);
  if (OneIs(kAnyTag, start, end)) return ToAny(z);
  return Settle(z, Slice(x, start, end));
}
inline int CalcFirstInverseSubString(Str z, Str& x, Int start, Int end) {
  if (IsNil(x)) return 0;
  if (IsNil(z)) return ToNil(x);
  if (IsAny(z) || OneIs(kAnyTag, start, end)) return ToAny(x);
  if (IsAny(x)) return 0;
  return !OneIs(kNilTag, start, end) && z.text == Slice(x, start, end) ? 0 : ToNil(x);
}
inline int Put(Int& t, Int value) { return t == value && value.tag != kExact ? 0 : (t = value, 1); }
// Narrows the start or the end, t as it was.
inline int Position(Str z, Str x, Int start, Int end, Int& t, bool isStart) {
  const ZORLong n = static_cast<ZORLong>(z.text.size());
  const Int known = isStart ? end : start;
  if (IsNil(z) || IsNil(x) || OneIs(kNilTag, start, end)) return Put(t, Int(kNilTag));
  if (IsAny(z) || IsAny(x)) return Put(t, Int());
  if (!OneIs(kAnyTag, start, end)) return z.text == Slice(x, start, end) ? 0 : Put(t, Int(kNilTag));
  if (t.tag == kExact) return 0;
  ZORLong at = static_cast<ZORLong>(x.text.find(z.text));  // below 0 when nowhere
  if (known.tag == kAnyTag && at < 0) return Put(t, Int(kNilTag));
  if (known.tag == kExact) at = isStart ? Wrap(std::int64_t{end.value} + 1 - n) : start.value;
  if (known.tag == kExact && Sub(x.text, at, n) != z.text) return Put(t, Int(kNilTag));
  return Put(t, Int(isStart ? at : Wrap(std::int64_t{at} + n - 1)));
}
inline int CalcSecondInverseSubString(Str z, Str x, Int& start, Int end) {
  return Position(z, x, start, end, start, true);
}
inline int CalcThirdInverseSubString(Str z, Str x, Int start, Int& end) {
  return Position(z, x, start, end, end, false);
}

// Case.
inline int Fold(Str& z, Str x, std::string (*fold)(std::string)) {
  if (IsNil(x) || IsNil(z)) return ToNil(z);
  if (IsAny(z) && IsAny(x)) return 0;
  if (IsMin(x)) return IsAny(z) ? ToMin(z) : IsMin(z) ? 0 : ToNil(z);
  if (IsMax(x)) return IsAny(z) ? ToMax(z) : IsMax(z) ? 0 : ToNil(z);
  if (IsMin(z) || IsMax(z)) return ToNil(z);
  if (IsAny(x)) return fold(z.text) == z.text ? 0 : ToNil(z);
  return Settle(z, fold(x.text));
}
inline int InverseFold(Str z, Str& x, std::string (*fold)(std::string)) {
  if (IsNil(z)) return ToNil(x);
  if ((IsMin(z) && IsMin(x)) || (IsMax(z) && IsMax(x))) return 0;
  if (IsMin(z) || IsMax(z) || IsMin(x) || IsMax(x)) return ToNil(x);
  if (IsAny(z)) return 0;
  return fold(IsAny(x) ? z.text : x.text) == z.text ? 0 : ToNil(x);
}
inline int CalcLowerValue(Str& z, Str x) { return Fold(z, x, Folded<'A', 'Z'>); }
inline int CalcInverseLowerValue(Str z, Str& x) { return InverseFold(z, x, Folded<'A', 'Z'>); }
inline int CalcUpperValue(Str& z, Str x) { return Fold(z, x, Folded<'a', 'z'>); }
inline int CalcInverseUpperValue(Str z, Str& x) { return InverseFold(z, x, Folded<'a', 'z'>); }

// Lengths, into and from a single integer.
inline int CalcLength(Str z, Int& n) {
  if (IsNil(z) || IsAny(z)) return n.tag == z.tag ? 0 : (n = Int(z.tag), 1);
  const Int length = static_cast<ZORLong>(z.text.size());
  if (n.tag == kNilTag || n == length) return 0;
  return n = n.tag == kAnyTag ? length : Int(kNilTag), 1;
}
inline int CalcInverseLength(Str& z, Int n) {
  if (IsNil(z)) return 0;
  if (n.tag != kExact) return n.tag == kNilTag ? ToNil(z) : 0;
  if (IsAny(z)) return n.value < 0 ? ToNil(z) : 0;
  return n.value == static_cast<ZORLong>(z.text.size()) ? 0 : ToNil(z);
}

// Texts that a value takes as such.
inline int SetExactValue(Str& z, Word w) { return z = Text(w.text), 0; }
inline int SetLowerBound(Str& z, Word w) { return z = Text(w.text), 0; }
inline int SetUpperBound(Str& z, Word w) { return z = Text(w.text), 0; }
inline int InsertExactValue(Str& z, Word w) {
  if (!IsAny(z) && (IsNil(z) || z.text != w.text)) z = IsNil(z) ? Text(w.text) : kAny;
  return 0;
}
inline int RemoveExactValue(Str& z, Word w) { return IsNil(z) || IsAny(z) || z.text != w.text ? 0 : ToNil(z); }

// Text forms. A zero character ends a text in them.
inline std::string Quoted(const std::string& text) { return std::string("\"") + text.c_str() + '"'; }
inline std::string Print(const Str& v) {
  return IsNil(v) ? "Nil" : IsAny(v) ? "Any" : IsMax(v) ? "Max" : IsMin(v) ? "Min" : Quoted(v.text);
}
// At most limit characters up to the delimiter, which is taken; a zero character hides the rest.
inline std::string Line(std::string_view& in, std::size_t limit, char delimiter) {
  const std::string line(in.substr(0, std::min({in.find(delimiter), limit, in.size()})));
  in.remove_prefix(line.size());
  if (in.starts_with(delimiter)) in.remove_prefix(1);
  return line.c_str();
}
inline Str Input(std::string_view& in) {
  in.remove_prefix(std::min(in.find_first_not_of(" \t\n\v\f\r"), in.size()));
  if (in.starts_with('"')) return in.remove_prefix(1), Text(Line(in, 254, '"'));
  if (in.empty() || std::string_view("MNA").find(in[0]) == std::string_view::npos) return kNil;
  const std::string word = Line(in, 3, '\n');
  return word == "Min" ? kMin : word == "Max" ? kMax : word == "Any" ? kAny : kNil;
}
inline int CalcStringRepresentation(Str& z, Str x) { return Put(z, Text(Print(x))); }
inline int CalcInverseStringRepresentation(Str z, Str& x) {
  std::string_view in = z.text.c_str();
  return Put(x, Input(in));
}

}  // namespace zor::test::model
