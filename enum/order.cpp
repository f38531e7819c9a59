// Order relations of sets of texts.
#include "enum/entries.h"

// *this <= x: both classes of x answer the same questions.
template <class X>
int ZORVadEnumString::CutAbove(const X& x) {
  if (IsNil() || x.IsNil()) return Nil();
  if (IsUndefined() || x.IsUndefined()) return 0;
  if (IsEmpty()) return 0;
  if (x.IsEmpty()) return Nil();
  if (x.IsFull()) return 0;
  if (IsFull()) return Nil();
  const ZORString bound = x.GetUpperBound();
  if (GetLowerBound() > bound) return Nil();
  if (GetUpperBound() <= bound) return 0;
  CutUpper(bound);
  return 1;
}

// The same relation, narrowing x: it is set to the bound even when all its texts lie below.
template <class X>
int ZORVadEnumString::RaiseTo(X& x) const {
  if (IsNil() || x.IsNil()) return x.Nil();
  if (IsUndefined() || x.IsUndefined()) return 0;
  const ZORString bound = GetLowerBound();
  if (x.GetLowerBound() >= bound) return 0;
  x.SetLowerBound(bound);
  return 1;
}

// A single x against the last text that is listed; the Max of a set with texts does not count.
int ZORVadEnumString::TestBelow(Single& x, bool strict) const {
  if (x.IsUndefined()) return 0;
  if (IsNil()) return x.Nil();
  if (IsUndefined()) return 0;
  const ZORString text = x.GetLowerBound();
  const ZORString& last = IsFull() ? ZorVaDoStringMax : Last();
  return (strict ? text >= last : text > last) ? x.Nil() : 0;
}

int ZORVadEnumString::CalcLessOrEqualValue(const ZORVadEnumString& x) { return CutAbove(x); }
int ZORVadEnumString::CalcLessOrEqualValue(const ZORVadSingleString& x) { return CutAbove(x); }
int ZORVadEnumString::CalcInverseLessOrEqualValue(ZORVadEnumString& x) const { return RaiseTo(x); }
int ZORVadEnumString::CalcInverseLessOrEqualValue(ZORVadSingleString& x) const { return RaiseTo(x); }

int ZORVadEnumString::CalcLessValue(const ZORVadEnumString& x) {
  if (IsUndefined()) return 0;
  if (GetUpperBound() < x.GetUpperBound()) return 0;
  return Nil();
}

int ZORVadEnumString::CalcInverseLessValue(ZORVadEnumString& x) const {
  if (x.IsUndefined()) return 0;
  if (GetUpperBound() < x.GetUpperBound()) return 0;
  return x.Nil();
}

int ZORVadEnumString::CalcNotLessValue(const ZORVadEnumString& x) { return x.CalcInverseLessOrEqualValue(*this); }
int ZORVadEnumString::CalcInverseNotLessValue(ZORVadEnumString& x) const { return x.CalcLessOrEqualValue(*this); }
int ZORVadEnumString::CalcInverseNotLessValue(ZORVadSingleString& x) const { return TestBelow(x, false); }
int ZORVadEnumString::CalcNotLessAndUnequalValue(const ZORVadEnumString& x) { return x.CalcInverseLessValue(*this); }
int ZORVadEnumString::CalcInverseNotLessAndUnequalValue(ZORVadEnumString& x) const { return x.CalcLessValue(*this); }
int ZORVadEnumString::CalcInverseNotLessAndUnequalValue(ZORVadSingleString& x) const { return TestBelow(x, true); }

// An order relation takes a single string where it has a form for one.
int ZORVadEnumString::CalcLessOrEqualValue(const ZORVaDoAny& x) {
  return zor::Narrowed<Enum, Single>(*this, x, [&](auto& a) { return CalcLessOrEqualValue(a); });
}

int ZORVadEnumString::CalcInverseLessOrEqualValue(ZORVaDoAny& x) const {
  return zor::Narrowed<Enum, Single>(*this, x, [&](auto& a) { return CalcInverseLessOrEqualValue(a); });
}

int ZORVadEnumString::CalcLessValue(const ZORVaDoScalar& x) {
  return zor::Narrowed<Enum>(*this, x, [&](auto& a) { return CalcLessValue(a); });
}

int ZORVadEnumString::CalcInverseLessValue(ZORVaDoScalar& x) const {
  return zor::Narrowed<Enum>(*this, x, [&](auto& a) { return CalcInverseLessValue(a); });
}

int ZORVadEnumString::CalcNotLessValue(const ZORVaDoScalar& x) {
  return zor::Narrowed<Enum>(*this, x, [&](auto& a) { return CalcNotLessValue(a); });
}

int ZORVadEnumString::CalcInverseNotLessValue(ZORVaDoScalar& x) const {
  return zor::Narrowed<Enum, Single>(*this, x, [&](auto& a) { return CalcInverseNotLessValue(a); });
}

int ZORVadEnumString::CalcNotLessAndUnequalValue(const ZORVaDoAny& x) {
  return zor::Narrowed<Enum>(*this, x, [&](auto& a) { return CalcNotLessAndUnequalValue(a); });
}

int ZORVadEnumString::CalcInverseNotLessAndUnequalValue(ZORVaDoAny& x) const {
  return zor::Narrowed<Enum, Single>(*this, x, [&](auto& a) { return CalcInverseNotLessAndUnequalValue(a); });
}
