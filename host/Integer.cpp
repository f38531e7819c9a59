// Operations common to all integers: each computes the numbers that its relation allows and keeps those.
#include "host/Guard.h"
#include "host/IntegerSet.h"
#include "host/NumberText.h"
#include "host/ZORNumbers.h"

using zorhost::AllBut;
using zorhost::Lower;
using zorhost::Numbers;
using zorhost::Part;
using zorhost::Range;
using zorhost::Union;
using zorhost::Upper;

namespace {

constexpr auto kLeast = ZORIntegerSet::kLeast;
constexpr auto kGreatest = ZORIntegerSet::kGreatest;

enum StateTag : ZORLong { kKnownTag, kUndefinedTag, kNilTag };

template <class... Args>
int Guarded(Args&&... args) {
  return zor::Guarded<ZORVaDoInteger>(args...);
}

bool IsExact(const ZORVaDoInteger& x) { return Lower(x) == Upper(x); }

// Whether a + distance <= b for some a in x and b in y.
bool CanBeLess(const ZORVaDoInteger& x, const ZORVaDoInteger& y, int distance) {
  return Lower(x) + distance <= Upper(y);
}

// The numbers less, greater than some number of x by distance or more.
Range LessThan(const ZORVaDoInteger& x, int distance) {
  return {kLeast, x.IsUndefined() != 0 ? kGreatest : Upper(x) - distance};
}
Range GreaterThan(const ZORVaDoInteger& x, int distance) {
  return {x.IsUndefined() != 0 ? kLeast : Lower(x) + distance, kGreatest};
}

// The least and the greatest common number; beyond the 32-bit range when there is none.
std::int64_t LeastCommon(const ZORVaDoInteger& x, const ZORVaDoInteger& y) {
  std::int64_t value = Lower(x);
  while (value <= kGreatest && y.FindAtLeast(value) != value) value = x.FindAtLeast(y.FindAtLeast(value));
  return value;
}
std::int64_t GreatestCommon(const ZORVaDoInteger& x, const ZORVaDoInteger& y) {
  std::int64_t value = Upper(x);
  while (value >= kLeast && y.FindAtMost(value) != value) value = x.FindAtMost(y.FindAtMost(value));
  return value;
}

}  // namespace

int ZORVaDoInteger::KeepEqual(const ZORVaDoInteger& other) {
  return other.IsUndefined() != 0 ? 0 : Keep(Numbers(other));
}

void ZORVaDoInteger::Assign(const ZORVaDoAny& other) {
  const auto* integer = DynamicCast(&other);
  if (integer == this) return;
  if (integer == nullptr) return SetNilValue();
  SetUndefinedValue();
  KeepEqual(*integer);
}

int ZORVaDoInteger::IsIntersected(const ZORVaDoAny& other) const {
  return Guarded(other, [&](auto& y) { return LeastCommon(*this, y) <= kGreatest; });
}

void ZORVaDoInteger::Intersect(const ZORVaDoAny& other) {
  const auto* integer = DynamicCast(&other);
  if (integer == nullptr) return SetNilValue();
  KeepEqual(*integer);
}

void ZORVaDoInteger::Unite(const ZORVaDoAny& other) {
  const auto* integer = DynamicCast(&other);
  if (integer == nullptr) return SetNilValue();
  if (IsUndefined() != 0 || integer->IsNil() != 0) return;
  if (integer->IsUndefined() != 0) return SetUndefinedValue();
  if (IsNil() != 0) return Assign(*integer);
  Join(*integer);
}

void ZORVaDoInteger::Bisect(ZORVaDoObject& other, ValueSelection selection) {
  auto* rest = DynamicCast(&other);
  if (rest == nullptr || rest == this || selection < ZorSelectLeast || selection > ZorSelectUpperHalf) return;
  const std::int64_t lower = Lower(*this), upper = Upper(*this);
  if (lower >= upper) return rest->SetNilValue();
  const std::int64_t middle = lower + (upper - lower) / 2;
  const std::int64_t cuts[] = {lower, upper - 1, middle, middle};  // the last number of the lower part
  const Range low(lower, cuts[selection]), high(cuts[selection] + 1, upper);
  const bool keepsLow = selection == ZorSelectLeast || selection == ZorSelectLowerHalf;
  rest->Assign(*this);
  rest->Keep(keepsLow ? high : low);
  Keep(keepsLow ? low : high);
}

void ZORVaDoInteger::SetExactValue(ZORLong value) { Keep(Range(value, value)); }

ZORLong ZORVaDoInteger::GetExactValue() const {
  if (IsNil() != 0 || IsUndefined() != 0) return ZORVadSingleInteger::sNC_INT_ANY;
  return static_cast<ZORLong>(Upper(*this));
}

int ZORVaDoInteger::CalcEqualValue(const ZORVaDoAny& other) {
  return Guarded(other, [&](auto& y) { return KeepEqual(y); });
}

int ZORVaDoInteger::CalcInverseEqualValue(ZORVaDoAny& target) const {
  return Guarded(target, [&](auto& y) { return y.KeepEqual(*this); });
}

int ZORVaDoInteger::CalcUnequalValue(const ZORVaDoAny& other) {
  return Guarded(other, [&](auto& y) {
    if (y.IsNil() != 0) return KeepEqual(y);
    return IsExact(y) ? Keep(AllBut(Lower(y))) : 0;
  });
}

int ZORVaDoInteger::CalcInverseUnequalValue(ZORVaDoAny& target) const {
  return Guarded(target, [&](auto& y) { return y.CalcUnequalValue(*this); });
}

int ZORVaDoInteger::CalcIsEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const {
  return Guarded(other, [&](auto& y) {
    return result.CalcOutcome(CanBeLess(*this, y, 1) || CanBeLess(y, *this, 1), IsIntersected(y) != 0);
  });
}

int ZORVaDoInteger::CalcIsLessOrEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const {
  return Guarded(other, [&](auto& y) { return result.CalcOutcome(CanBeLess(y, *this, 1), CanBeLess(*this, y, 0)); });
}

int ZORVaDoInteger::CalcIsLess(const ZORVaDoScalar& other, ZORVaDoBoolean& result) const {
  return Guarded(other, [&](auto& y) { return result.CalcOutcome(CanBeLess(y, *this, 0), CanBeLess(*this, y, 1)); });
}

int ZORVaDoInteger::CalcLessValue(const ZORVaDoScalar& other) {
  return Guarded(other, [&](auto& y) { return Keep(LessThan(y, 1)); });
}

int ZORVaDoInteger::CalcLessOrEqualValue(const ZORVaDoAny& other) {
  return Guarded(other, [&](auto& y) { return Keep(LessThan(y, 0)); });
}

int ZORVaDoInteger::CalcNotLessValue(const ZORVaDoScalar& other) {
  return Guarded(other, [&](auto& y) { return Keep(GreaterThan(y, 0)); });
}

int ZORVaDoInteger::CalcNotLessAndUnequalValue(const ZORVaDoAny& other) {
  return Guarded(other, [&](auto& y) { return Keep(GreaterThan(y, 1)); });
}

// The inverse of a relation is its mirror image, called on the other operand.
int ZORVaDoInteger::CalcInverseLessValue(ZORVaDoScalar& target) const {
  return Guarded(target, [&](auto& y) { return y.CalcNotLessAndUnequalValue(*this); });
}

int ZORVaDoInteger::CalcInverseLessOrEqualValue(ZORVaDoAny& target) const {
  return Guarded(target, [&](auto& y) { return y.CalcNotLessValue(*this); });
}

int ZORVaDoInteger::CalcInverseNotLessValue(ZORVaDoScalar& target) const {
  return Guarded(target, [&](auto& y) { return y.CalcLessOrEqualValue(*this); });
}

int ZORVaDoInteger::CalcInverseNotLessAndUnequalValue(ZORVaDoAny& target) const {
  return Guarded(target, [&](auto& y) { return y.CalcLessValue(*this); });
}

int ZORVaDoInteger::CalcMinValue() { return Keep(Range(kLeast, kLeast)); }
int ZORVaDoInteger::CalcMaxValue() { return Keep(Range(kGreatest, kGreatest)); }

int ZORVaDoInteger::CalcMinValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return Guarded(x, y,
                 [&](auto& a, auto& b) { return Keep(Union(Part(a, kLeast, Upper(b)), Part(b, kLeast, Upper(a)))); });
}

int ZORVaDoInteger::CalcMaxValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return Guarded(
      x, y, [&](auto& a, auto& b) { return Keep(Union(Part(a, Lower(b), kGreatest), Part(b, Lower(a), kGreatest))); });
}

// Either target is the minimum, or second is and target is not less.
int ZORVaDoInteger::CalcFirstInverseMinValue(ZORVaDoAny& target, const ZORVaDoAny& second) const {
  return Guarded(target, second, [&](auto& x, auto& y) {
    return x.Keep(Union(Part(*this, kLeast, Upper(y)), Range(LeastCommon(*this, y), kGreatest)));
  });
}

int ZORVaDoInteger::CalcFirstInverseMaxValue(ZORVaDoAny& target, const ZORVaDoAny& second) const {
  return Guarded(target, second, [&](auto& x, auto& y) {
    return x.Keep(Union(Part(*this, Lower(y), kGreatest), Range(kLeast, GreatestCommon(*this, y))));
  });
}

int ZORVaDoInteger::CalcNextValue(const ZORVaDoScalar& other) {
  return Guarded(other, [&](auto& y) { return y.IsUndefined() != 0 ? 0 : Keep(Numbers(y, 1)); });
}

int ZORVaDoInteger::CalcInverseNextValue(ZORVaDoScalar& target) const {
  return Guarded(target, [&](auto& y) { return IsUndefined() != 0 ? 0 : y.Keep(Numbers(*this, -1)); });
}

void ZORVaDoInteger::PrintOn(ZORostrstream& out) const {
  if (IsNil() != 0) {
    out << zorhost::kNilWord;
  } else if (IsUndefined() != 0) {
    out << zorhost::kAnyWord;
  } else {
    PrintKnown(out);
  }
}

void ZORVaDoInteger::InputValue(ZORistrstream& in) {
  SetNilValue();
  const std::string word = zorhost::ReadWord(in);
  if (word == zorhost::kAnyWord) SetUndefinedValue();
  if (word.empty()) InputKnown(in);
}

void ZORVaDoInteger::Write(ZORopstream& out) const {
  const StateTag tag = IsNil() != 0 ? kNilTag : IsUndefined() != 0 ? kUndefinedTag : kKnownTag;
  out << tag;
  if (tag == kKnownTag) WriteKnown(out);
}

void ZORVaDoInteger::Read(ZORipstream& in) {
  ZORLong tag;
  in >> tag;
  if (tag < kKnownTag || tag > kNilTag) in.SetFail();
  SetNilValue();
  if (tag == kUndefinedTag) SetUndefinedValue();
  if (tag == kKnownTag) ReadKnown(in);
  if (in.Fail()) SetNilValue();
}
