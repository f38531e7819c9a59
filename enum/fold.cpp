// Lower and upper case of sets of texts.
#include <algorithm>
#include <utility>

#include "enum/entries.h"

using zor::Fold;
using zor::Folded;
using zor::IsFolded;

namespace {

bool AreFolds(const ZORVadEnumString& z, const ZORVadEnumString& x, Fold fold) {
  if (x.Count() != z.Count()) return false;
  for (int i = 0; i < z.Count(); ++i) {
    if (!(Folded(x.GetValue(i), fold) == z.GetValue(i))) return false;
  }
  return true;
}

bool AreFolds(const ZORVadEnumString& z, const ZORVadSingleString& x, Fold fold) {
  return z.Count() == 1 && Folded(x.GetLowerBound(), fold) == z.GetValue(0);
}

bool HasFold(const ZORVadEnumString& z, Fold fold) {
  for (int i = 0; i < z.Count(); ++i) {
    if (IsFolded(z.GetValue(i), fold)) return true;
  }
  return false;
}

// Both values must be the same extreme, or neither be one. An Undefined x stays if some text of z is folded.
template <class X>
int TestFolds(const ZORVadEnumString& z, X& x, Fold fold) {
  if (z.IsUndefined()) return 0;
  if (z.IsNil() && x.IsNil()) return 0;
  if (z.IsEmpty() && x.IsEmpty()) return 0;
  if (z.IsFull() && x.IsFull()) return 0;
  if (z.IsNil() || z.IsEmpty() || z.IsFull()) return x.Nil();
  if (x.IsNil() || x.IsEmpty() || x.IsFull()) return x.Nil();
  if (!x.IsUndefined()) return AreFolds(z, x, fold) ? 0 : x.Nil();
  if (z.GetState() != ZORVaDoString::ZorStringExact) return 0;
  return HasFold(z, fold) ? 0 : x.Nil();
}

}  // namespace

// Min and Max fold to themselves, whatever their text.
template <class X>
int ZORVadEnumString::CalcFoldValue(const X& x, Fold fold) {
  if (IsNil()) return 0;
  if (x.IsUndefined()) return 0;
  if (x.IsNil()) return Nil();
  if (x.IsEmpty()) return MeetLeast();
  if (x.IsFull()) return MeetGreatest();
  return MeetFolds(x, fold);
}

int ZORVadEnumString::MeetFolds(const Enum& x, Fold fold) {
  if (CanMark(x.mTexts.Count())) {
    Texts::Marks marks;
    unsigned int near = 0;
    for (const ZORString* const text : x.mTexts.All()) mTexts.Mark(Folded(*text, fold), marks, near);
    return Keep(marks);
  }
  Texts folds(x.mTexts.Count());
  for (const ZORString* const text : x.mTexts.All()) {
    if (folds.Count() == zor::kSetLimit) return 0;  // too many results: nothing is narrowed
    folds.Insert(Folded(*text, fold));
  }
  return Narrow(std::move(folds));
}

int ZORVadEnumString::MeetFolds(const Single& x, Fold fold) {
  if (IsFull()) return Nil();
  const ZORString text = Folded(x.GetLowerBound(), fold);
  if (IsUndefined()) return Become(ZorStringExact, text);
  if (mTexts.First() == text) return 0;
  return Nil();
}

int ZORVadEnumString::CalcLowerValue(const Enum& x) { return CalcFoldValue(x, &ZORString::ToLower); }
int ZORVadEnumString::CalcLowerValue(const Single& x) { return CalcFoldValue(x, &ZORString::ToLower); }
int ZORVadEnumString::CalcUpperValue(const Enum& x) { return CalcFoldValue(x, &ZORString::ToUpper); }
int ZORVadEnumString::CalcUpperValue(const Single& x) { return CalcFoldValue(x, &ZORString::ToUpper); }

int ZORVadEnumString::CalcInverseLowerValue(Enum& x) const { return TestFolds(*this, x, &ZORString::ToLower); }
int ZORVadEnumString::CalcInverseLowerValue(Single& x) const { return TestFolds(*this, x, &ZORString::ToLower); }
int ZORVadEnumString::CalcInverseUpperValue(Enum& x) const { return TestFolds(*this, x, &ZORString::ToUpper); }
int ZORVadEnumString::CalcInverseUpperValue(Single& x) const { return TestFolds(*this, x, &ZORString::ToUpper); }

int ZORVadEnumString::CalcLowerValue(const ZORVaDoString& x) {
  return zor::Narrowed<Enum, Single>(*this, x, [&](auto& a) { return CalcLowerValue(a); });
}

int ZORVadEnumString::CalcUpperValue(const ZORVaDoString& x) {
  return zor::Narrowed<Enum, Single>(*this, x, [&](auto& a) { return CalcUpperValue(a); });
}

int ZORVadEnumString::CalcInverseLowerValue(ZORVaDoString& x) const {
  return zor::Narrowed<Enum, Single>(*this, x, [&](auto& a) { return CalcInverseLowerValue(a); });
}

int ZORVadEnumString::CalcInverseUpperValue(ZORVaDoString& x) const {
  return zor::Narrowed<Enum, Single>(*this, x, [&](auto& a) { return CalcInverseUpperValue(a); });
}
