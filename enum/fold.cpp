// Lower and upper case of sets of texts.
#include "enum/entries.h"
#include "enum/insertion.h"

using zor::Folded;
using zor::IsFolded;

// The extremes fold to themselves, whatever their text; anything between goes to fitting.
template <class X, class Fitting>
int ZORVadEnumString::MeetFolds(const X& x, Fitting fitting) {
  if (IsNil()) return 0;
  if (x.IsUndefined()) return 0;
  if (x.IsNil()) return Nil();
  if (x.IsEmpty()) return MeetLeast();
  if (x.IsFull()) return MeetGreatest();
  return fitting();
}

int ZORVadEnumString::CalcFoldValue(const Enum& x, zor::Fold fold) {
  return MeetFolds(x, [&] {
    if (CanMark(x.mVector.Count())) {
      Marks marks;
      unsigned int next = 0;
      for (ZORISVectorIteratorImp_String text(x.mVector); text; ++text)
        Mark(Folded(*text.Current(), fold), marks, next);
      return KeepMarked(marks);
    }
    ZORVadEnumString folds(x.mVector.Count());
    for (ZORISVectorIteratorImp_String text(x.mVector); text; ++text) folds.PlaceExact(Folded(*text.Current(), fold));
    return Narrow(folds);
  });
}

int ZORVadEnumString::CalcFoldValue(const Single& x, zor::Fold fold) {
  return MeetFolds(x, [&] {
    if (IsFull()) return Nil();
    const ZORString text = Folded(x.GetLowerBound(), fold);
    if (IsUndefined()) return Become(ZorStringExact, text);
    if (First() == text) return 0;
    return Nil();
  });
}

// Both values must be at the same extreme or at none. An Undefined x stays as long as some text could fold to ours.
template <class X, class Fits>
int ZORVadEnumString::TestFolds(X& x, zor::Fold fold, Fits fits) const {
  if (IsUndefined()) return 0;
  if (IsNil() && x.IsNil()) return 0;
  if (IsEmpty() && x.IsEmpty()) return 0;
  if (IsFull() && x.IsFull()) return 0;
  if (IsNil() || IsEmpty() || IsFull()) return x.Nil();
  if (x.IsNil() || x.IsEmpty() || x.IsFull()) return x.Nil();
  if (!x.IsUndefined()) return fits() ? 0 : x.Nil();
  if (mState != ZorStringExact) return 0;
  for (ZORISVectorIteratorImp_String text(mVector); text; ++text) {
    if (IsFolded(*text.Current(), fold)) return 0;
  }
  return x.Nil();
}

int ZORVadEnumString::CalcInverseFoldValue(Enum& x, zor::Fold fold) const {
  return TestFolds(x, fold, [&] {
    if (x.Count() != Count()) return false;
    for (unsigned int i = 0; i < mVector.Count(); ++i) {
      if (!(Folded(*x.mVector[i], fold) == *mVector[i])) return false;
    }
    return true;
  });
}

int ZORVadEnumString::CalcInverseFoldValue(Single& x, zor::Fold fold) const {
  return TestFolds(x, fold, [&] { return Count() == 1 && Folded(x.GetLowerBound(), fold) == First(); });
}

int ZORVadEnumString::CalcLowerValue(const Enum& x) { return CalcFoldValue(x, &ZORString::ToLower); }
int ZORVadEnumString::CalcLowerValue(const Single& x) { return CalcFoldValue(x, &ZORString::ToLower); }
int ZORVadEnumString::CalcUpperValue(const Enum& x) { return CalcFoldValue(x, &ZORString::ToUpper); }
int ZORVadEnumString::CalcUpperValue(const Single& x) { return CalcFoldValue(x, &ZORString::ToUpper); }

int ZORVadEnumString::CalcInverseLowerValue(Enum& x) const { return CalcInverseFoldValue(x, &ZORString::ToLower); }
int ZORVadEnumString::CalcInverseLowerValue(Single& x) const { return CalcInverseFoldValue(x, &ZORString::ToLower); }
int ZORVadEnumString::CalcInverseUpperValue(Enum& x) const { return CalcInverseFoldValue(x, &ZORString::ToUpper); }
int ZORVadEnumString::CalcInverseUpperValue(Single& x) const { return CalcInverseFoldValue(x, &ZORString::ToUpper); }

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
