// Set operations of single strings: intersection, equality and union.
#include "host/Guard.h"
#include "single/ZORVadSingleString.h"

int ZORVadSingleString::Intersect(const ZORVadSingleString& other) {
  if (IsNil()) return 0;
  if (other.IsUndefined()) return 0;
  if (other.IsNil()) return Nil();
  if (other.IsEmpty()) return CalcMinValue();
  if (other.IsFull()) return CalcMaxValue();
  return Settle(other.mText);
}

int ZORVadSingleString::CalcEqualValue(const ZORVadSingleString& other) { return Intersect(other); }

void ZORVadSingleString::Unite(const ZORVadSingleString& other) {
  if (IsUndefined()) return;
  if (other.IsUndefined()) return SetUndefinedValue();
  if (other.IsNil()) return;
  if ((IsEmpty() && other.IsEmpty()) || (IsFull() && other.IsFull())) return;
  if (IsEmpty() || IsFull() || other.IsEmpty() || other.IsFull()) return SetUndefinedValue();
  if (IsNil()) return SetExactValue(other.mText);
  if (mText == other.mText) return;
  SetUndefinedValue();
}

int ZORVadSingleString::IsIntersected(const ZORVaDoAny& other) const {
  if (IsNil() || zor::IsNil(other)) return 0;
  if (IsUndefined() || zor::IsUndefined(other)) return 1;
  return zor::Guarded<Single>(other, [&](auto& single) { return mText == single.mText ? 1 : 0; });
}

void ZORVadSingleString::Intersect(const ZORVaDoAny& other) {
  zor::GuardedOrNil<Single>(*this, other, [&](auto& single) { return Intersect(single); });
}

int ZORVadSingleString::CalcEqualValue(const ZORVaDoAny& other) {
  return zor::Guarded<Single>(other, [&](auto& single) { return CalcEqualValue(single); });
}

int ZORVadSingleString::CalcInverseEqualValue(ZORVaDoAny& target) const {
  return zor::Guarded<Single>(target, [&](auto& single) { return single.Intersect(*this); });
}

void ZORVadSingleString::Unite(const ZORVaDoAny& other) {
  zor::GuardedOrNil<Single>(*this, other, [&](auto& single) { return Unite(single), 0; });
}

void ZORVadSingleString::Bisect(ZORVaDoObject&, ValueSelection) { Nil(); }
