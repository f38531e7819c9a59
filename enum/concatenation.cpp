// Concatenation of sets of texts, and the operations that tell a set nothing.
#include "enum/dispatch.h"

int ZORVadEnumString::CalcConcatenation(const ZORVadEnumString& x, const ZORVadEnumString& y) {
  if (IsNil() || x.IsNil() || y.IsNil()) return Nil();
  if (x.IsUndefined() || y.IsUndefined()) return 0;
  if (x.IsFull() || y.IsFull()) return CalcMaxValue();
  ZORVadEnumString candidates(ZorStringNil);
  for (ZORISVectorIteratorImp_String head(x.mVector); head; ++head) {
    for (ZORISVectorIteratorImp_String tail(y.mVector); tail; ++tail) {
      ZORString text(*head.Current());
      candidates.InsertExactValue(text.Append(*tail.Current()));
      if (candidates.IsUndefined()) return 0;  // more than a set can hold
    }
  }
  return Narrow(candidates);
}

int ZORVadEnumString::CalcFirstInverseConcatenation(ZORVadEnumString&, const ZORVadEnumString&) const { return 0; }
int ZORVadEnumString::CalcSecondInverseConcatenation(const ZORVadEnumString&, ZORVadEnumString&) const { return 0; }

int ZORVadEnumString::CalcConcatenation(const ZORVaDoString& x, const ZORVaDoString& y) {
  return zor::Guarded<Enum>(x, y, [&](auto& a, auto& b) {
    return zor::Narrowed(
        *this, [&] { return CalcConcatenation(a, b); }, a, b);
  });
}

// All that a set tells the parts of a concatenation is a contradiction.
int ZORVadEnumString::CalcFirstInverseConcatenation(ZORVaDoString& x, const ZORVaDoString& y) const {
  return zor::Guarded<Enum>(x, y, [&](auto& a, auto&) {
    return zor::Narrowed(
        a, [] { return 0; }, *this);
  });
}

int ZORVadEnumString::CalcSecondInverseConcatenation(const ZORVaDoString& x, ZORVaDoString& y) const {
  return zor::Guarded<Enum>(x, y, [&](auto&, auto& b) {
    return zor::Narrowed(
        b, [] { return 0; }, *this);
  });
}

// clang-format off
int ZORVadEnumString::CalcStringRepresentation       (const ZORVaDoAny&) { return 0; }
int ZORVadEnumString::CalcInverseStringRepresentation(ZORVaDoAny&) const { return 0; }
int ZORVadEnumString::CalcSubString             (const ZORVaDoString&, const ZORVaDoInteger&, const ZORVaDoInteger&) { return 0; }
int ZORVadEnumString::CalcFirstInverseSubString (ZORVaDoString&, const ZORVaDoInteger&, const ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcSecondInverseSubString(const ZORVaDoString&, ZORVaDoInteger&, const ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcThirdInverseSubString (const ZORVaDoString&, const ZORVaDoInteger&, ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcSubString             (const Enum&, const ZORVaDoInteger&, const ZORVaDoInteger&) { return 0; }
int ZORVadEnumString::CalcFirstInverseSubString (Enum&, const ZORVaDoInteger&, const ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcSecondInverseSubString(const Enum&, ZORVaDoInteger&, const ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcThirdInverseSubString (const Enum&, const ZORVaDoInteger&, ZORVaDoInteger&) const { return 0; }
// clang-format on
