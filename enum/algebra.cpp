// Set operations of sets of texts: intersection, equality and union.
#include <utility>

#include "enum/entries.h"

namespace {

// Unite with either class of x; add adds the texts of a known x to a known z.
template <class X, class Add>
void UniteWith(ZORVadEnumString& z, const X& x, Add add) {
  if (z.IsUndefined()) return;
  if (x.IsUndefined()) return z.SetUndefinedValue();
  if (x.IsNil()) return;
  if (z.IsNil()) {
    z.Copy(x);
  } else {
    add();
  }
}

}  // namespace

int ZORVadEnumString::Intersect(const ZORVadEnumString& other) {
  if (IsNil()) return 0;
  if (other.IsNil()) return Nil();
  if (other.IsUndefined()) return 0;
  if (IsFull() && other.mState == ZorStringMax) return 0;
  if (IsFull()) return Nil();
  if (IsUndefined()) return Copy(other), 1;
  return Keep(other.mTexts.Vector());
}

int ZORVadEnumString::Intersect(const ZORISVectorImp_String& texts) {
  if (IsNil()) return 0;
  if (!IsUndefined()) return Keep(texts);
  Append(texts);
  mState = Count() > 0 ? ZorStringExact : ZorStringNil;
  return 1;
}

// Intersects with candidates, which an operation has built.
int ZORVadEnumString::Narrow(Texts&& candidates) {
  const bool some = candidates.Count() > 0;
  if (IsUndefined()) return Become(some ? ZorStringExact : ZorStringNil, std::move(candidates));
  if (!some || IsFull()) return Nil();
  return Keep(candidates.Vector());
}

// An Undefined or Max operand returns before the content of *this is examined.
int ZORVadEnumString::Intersect(const ZORVadSingleString& other) {
  if (IsNil()) return 0;
  if (other.IsNil()) return Nil();
  if (other.IsUndefined()) return 0;
  if (other.IsFull()) return 0;
  if (IsFull()) return Nil();
  if (IsUndefined()) return Copy(other);
  if (Contains(other.GetLowerBound()) == 0) return Nil();
  return Copy(other);
}

int ZORVadEnumString::IntersectInverse(ZORVadSingleString& target) const {
  if (target.IsNil()) return 0;
  if (IsUndefined()) return 0;
  if (IsNil()) return target.Nil();
  if (target.IsUndefined() && Count() == 1) return target.Copy(mTexts.First());
  if (target.IsUndefined()) return 0;
  if (Contains(target.GetLowerBound()) != 0) return 0;
  return target.Nil();
}

int ZORVadEnumString::CalcEqualValue(const ZORVadEnumString& other) { return Intersect(other); }
int ZORVadEnumString::CalcEqualValue(const ZORVadSingleString& other) { return Intersect(other); }
int ZORVadEnumString::CalcInverseEqualValue(ZORVadEnumString& target) const { return target.Intersect(*this); }
int ZORVadEnumString::CalcInverseEqualValue(ZORVadSingleString& target) const { return IntersectInverse(target); }

void ZORVadEnumString::Unite(const ZORVadEnumString& other) {
  UniteWith(*this, other, [&] { Append(other); });
}

void ZORVadEnumString::Unite(const ZORVadSingleString& other) {
  UniteWith(*this, other, [&] { Insert(other.GetLowerBound()); });
}

int ZORVadEnumString::IsIntersected(const ZORVaDoAny& other) const {
  if (IsNil() || zor::IsNil(other)) return 0;
  if (IsUndefined() || zor::IsUndefined(other)) return 1;
  if (const auto* const single = Single::DynamicCast(&other)) {
    if (IsFull()) return single->IsFull();
    return Contains(single->GetLowerBound()) != 0;
  }
  if (const auto* const set = Enum::DynamicCast(&other)) {
    if (IsFull()) return set->mState == ZorStringMax;
    for (const ZORString* const text : set->mTexts.All()) {
      if (Contains(text) != 0) return 1;
    }
  }
  return 0;
}

void ZORVadEnumString::Intersect(const ZORVaDoAny& other) {
  zor::GuardedOrNil<Enum, Single>(*this, other, [&](auto& string) { return Intersect(string); });
}

void ZORVadEnumString::Unite(const ZORVaDoAny& other) {
  zor::GuardedOrNil<Enum, Single>(*this, other, [&](auto& string) { return Unite(string), 0; });
}

int ZORVadEnumString::CalcEqualValue(const ZORVaDoAny& other) {
  return zor::Guarded<Enum, Single>(other, [&](auto& string) { return CalcEqualValue(string); });
}

int ZORVadEnumString::CalcInverseEqualValue(ZORVaDoAny& target) const {
  return zor::Guarded<Enum, Single>(target, [&](auto& string) { return CalcInverseEqualValue(string); });
}

void ZORVadEnumString::Bisect(ZORVaDoObject& other, ValueSelection selection) {
  const auto leaveWhole = [&](auto&) { return selection >= 0 && selection <= 3 ? 0 : Nil(); };
  zor::GuardedOrNil<Enum>(*this, other, leaveWhole);
}
