// Order relations of single strings.
#include "host/Guard.h"
#include "single/ZORVadSingleString.h"

// a < b if strict, else a <= b; target is a or b. The relations differ when both are the same extreme.
int ZORVadSingleString::NarrowOrder(const Single& a, const Single& b, Single& target, bool strict) {
  if (a.IsNil() || b.IsNil()) return target.Nil();
  if (a.IsUndefined() || b.IsUndefined()) return 0;
  if (strict && (a.IsFull() || b.IsEmpty())) return target.Nil();
  if (a.IsEmpty() || b.IsFull()) return 0;
  if (a.IsFull() || b.IsEmpty()) return target.Nil();
  const bool holds = strict ? a.mText < b.mText : a.mText <= b.mText;
  return holds ? 0 : target.Nil();
}

int ZORVadSingleString::CalcLessValue(const ZORVadSingleString& x) { return NarrowOrder(*this, x, *this, true); }

int ZORVadSingleString::CalcInverseLessValue(ZORVadSingleString& x) const { return NarrowOrder(*this, x, x, true); }

int ZORVadSingleString::CalcLessOrEqualValue(const ZORVadSingleString& x) {
  return NarrowOrder(*this, x, *this, false);
}

int ZORVadSingleString::CalcInverseLessOrEqualValue(ZORVadSingleString& x) const {
  return NarrowOrder(*this, x, x, false);
}

int ZORVadSingleString::CalcNotLessValue(const ZORVadSingleString& x) { return x.CalcInverseLessOrEqualValue(*this); }

int ZORVadSingleString::CalcInverseNotLessValue(ZORVadSingleString& x) const { return x.CalcLessOrEqualValue(*this); }

int ZORVadSingleString::CalcNotLessAndUnequalValue(const ZORVadSingleString& x) {
  return x.CalcInverseLessValue(*this);
}

int ZORVadSingleString::CalcInverseNotLessAndUnequalValue(ZORVadSingleString& x) const {
  return x.CalcLessValue(*this);
}

int ZORVadSingleString::CalcLessValue(const ZORVaDoScalar& x) {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcLessValue(a); });
}

int ZORVadSingleString::CalcInverseLessValue(ZORVaDoScalar& x) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcInverseLessValue(a); });
}

int ZORVadSingleString::CalcLessOrEqualValue(const ZORVaDoAny& x) {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcLessOrEqualValue(a); });
}

int ZORVadSingleString::CalcInverseLessOrEqualValue(ZORVaDoAny& x) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcInverseLessOrEqualValue(a); });
}

int ZORVadSingleString::CalcNotLessValue(const ZORVaDoScalar& x) {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcNotLessValue(a); });
}

int ZORVadSingleString::CalcInverseNotLessValue(ZORVaDoScalar& x) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcInverseNotLessValue(a); });
}

int ZORVadSingleString::CalcNotLessAndUnequalValue(const ZORVaDoAny& x) {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcNotLessAndUnequalValue(a); });
}

int ZORVadSingleString::CalcInverseNotLessAndUnequalValue(ZORVaDoAny& x) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcInverseNotLessAndUnequalValue(a); });
}
