// Order relations of sets of texts.
#include <functional>

#include "enum/entries.h"

namespace {

using Enum = ZORVadEnumString;
using Single = ZORVadSingleString;

// z <= x, cutting z; x is of either class.
template <class X>
int CutToUpperBound(Enum& z, const X& x) {
  if (z.IsNil() || x.IsNil()) return z.Nil();
  if (z.IsUndefined() || x.IsUndefined()) return 0;
  if (z.IsEmpty()) return 0;
  if (x.IsEmpty()) return z.Nil();
  if (x.IsFull()) return 0;
  if (z.IsFull()) return z.Nil();
  const ZORString bound = x.GetUpperBound();
  if (z.GetLowerBound() > bound) return z.Nil();
  if (z.GetUpperBound() <= bound) return 0;
  z.CutUpper(bound);
  return 1;
}

// z <= x, narrowing x, which gets the bound as a text even if all its texts are less.
template <class X>
int RaiseToLowerBound(const Enum& z, X& x) {
  if (z.IsNil() || x.IsNil()) return x.Nil();
  if (z.IsUndefined() || x.IsUndefined()) return 0;
  const ZORString bound = z.GetLowerBound();
  if (x.GetLowerBound() >= bound) return 0;
  x.SetLowerBound(bound);
  return 1;
}

// Compares a single x with the last text of z; the state Max counts only for a full z.
template <class Fails>
int TestAgainstLast(const Enum& z, Single& x, Fails fails) {
  if (x.IsUndefined()) return 0;
  if (z.IsNil()) return x.Nil();
  if (z.IsUndefined()) return 0;
  const ZORString& last = z.IsFull() ? ZORVaDoString::ZorVaDoStringMax : z.GetValue(z.Count() - 1);
  return fails(x.GetLowerBound(), last) ? x.Nil() : 0;
}

}  // namespace

int ZORVadEnumString::CalcLessOrEqualValue(const ZORVadEnumString& x) { return CutToUpperBound(*this, x); }
int ZORVadEnumString::CalcLessOrEqualValue(const ZORVadSingleString& x) { return CutToUpperBound(*this, x); }
int ZORVadEnumString::CalcInverseLessOrEqualValue(ZORVadEnumString& x) const { return RaiseToLowerBound(*this, x); }
int ZORVadEnumString::CalcInverseLessOrEqualValue(ZORVadSingleString& x) const { return RaiseToLowerBound(*this, x); }

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
int ZORVadEnumString::CalcInverseNotLessValue(ZORVadSingleString& x) const {
  return TestAgainstLast(*this, x, std::greater());
}
int ZORVadEnumString::CalcNotLessAndUnequalValue(const ZORVadEnumString& x) { return x.CalcInverseLessValue(*this); }
int ZORVadEnumString::CalcInverseNotLessAndUnequalValue(ZORVadEnumString& x) const { return x.CalcLessValue(*this); }
int ZORVadEnumString::CalcInverseNotLessAndUnequalValue(ZORVadSingleString& x) const {
  return TestAgainstLast(*this, x, std::greater_equal());
}

// Entries accept a single string where there is a typed form for one.
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
