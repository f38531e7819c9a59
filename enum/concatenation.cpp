// Concatenation of sets of texts, and the operations that tell a set nothing.
#include <string_view>

#include "enum/entries.h"
#include "enum/insertion.h"
#include "module/textview.h"

// Marks the listed texts that are a head and a tail. Those that begin with one head stand together, in the order of
// what follows it, so that one walk compares them with the tails. Of equal texts the first alone can be meant.
void ZORVadEnumString::MarkPairs(const Enum& heads, const Enum& tails, Marks& marks) const {
  const unsigned int count = mVector.Count(), countTails = tails.mVector.Count();
  for (unsigned int h = 0; h < heads.mVector.Count(); ++h) {
    const std::string_view head = zor::View(*heads.mVector[h]);
    unsigned int t = 0;
    for (unsigned int i = CountBelow(mVector, *heads.mVector[h]); i < count; ++i) {
      const std::string_view text = zor::View(*mVector[i]);
      if (text.substr(0, head.size()) != head) break;
      const std::string_view rest = text.substr(head.size());
      while (t < countTails && zor::View(*tails.mVector[t]) < rest) ++t;
      if (t == countTails) break;
      if (zor::View(*tails.mVector[t]) == rest && (i == 0 || *mVector[i - 1] != *mVector[i])) marks.set(i);
    }
  }
}

int ZORVadEnumString::CalcConcatenation(const ZORVadEnumString& x, const ZORVadEnumString& y) {
  if (IsNil() || x.IsNil() || y.IsNil()) return Nil();
  if (x.IsUndefined() || y.IsUndefined()) return 0;
  if (x.IsFull() || y.IsFull()) return CalcMaxValue();
  const std::size_t pairs = std::size_t{x.mVector.Count()} * y.mVector.Count();
  if (CanMark(pairs)) {
    Marks marks;
    MarkPairs(x, y, marks);
    return KeepMarked(marks);
  }
  ZORVadEnumString candidates(pairs);
  for (ZORISVectorIteratorImp_String head(x.mVector); head; ++head) {
    for (ZORISVectorIteratorImp_String tail(y.mVector); tail; ++tail) {
      candidates.PlaceExact(ZORString::Concatenation(*head.Current(), *tail.Current()));
      if (candidates.IsUndefined()) return 0;  // more than a set can hold tells nothing
    }
  }
  return Narrow(candidates);
}

int ZORVadEnumString::CalcFirstInverseConcatenation(ZORVadEnumString&, const ZORVadEnumString&) const { return 0; }
int ZORVadEnumString::CalcSecondInverseConcatenation(const ZORVadEnumString&, ZORVadEnumString&) const { return 0; }

int ZORVadEnumString::CalcConcatenation(const ZORVaDoString& x, const ZORVaDoString& y) {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcConcatenation(a, b); });
}

// All that a set tells the parts of a concatenation is a contradiction.
int ZORVadEnumString::CalcFirstInverseConcatenation(ZORVaDoString& x, const ZORVaDoString& y) const {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcFirstInverseConcatenation(a, b); });
}

int ZORVadEnumString::CalcSecondInverseConcatenation(const ZORVaDoString& x, ZORVaDoString& y) const {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcSecondInverseConcatenation(a, b); });
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
