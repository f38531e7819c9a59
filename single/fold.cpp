// Lower and upper case of single strings.
#include "host/Guard.h"
#include "single/ZORVadSingleString.h"

using zor::Folded;
using zor::IsFolded;

// Min and Max fold to themselves, whatever their text.
int ZORVadSingleString::CalcFoldValue(const Single& x, zor::Fold fold) {
  if (x.IsNil() || IsNil()) return Nil();
  if (IsUndefined() && x.IsUndefined()) return 0;
  if (x.IsEmpty()) return MeetLeast();
  if (x.IsFull()) return MeetGreatest();
  if (IsEmpty() || IsFull()) return Nil();
  if (x.IsUndefined()) return IsFolded(mText, fold) ? 0 : Nil();
  return Settle(Folded(x.mText, fold));
}

int ZORVadSingleString::CalcInverseFoldValue(Single& x, zor::Fold fold) const {
  if (IsNil()) return x.Nil();
  if ((IsEmpty() && x.IsEmpty()) || (IsFull() && x.IsFull())) return 0;
  if (IsEmpty() || IsFull() || x.IsEmpty() || x.IsFull()) return x.Nil();
  if (IsUndefined()) return 0;
  if (x.IsUndefined()) return IsFolded(mText, fold) ? 0 : x.Nil();
  return Folded(x.mText, fold) == mText ? 0 : x.Nil();
}

int ZORVadSingleString::CalcLowerValue(const ZORVadSingleString& x) { return CalcFoldValue(x, &ZORString::ToLower); }

int ZORVadSingleString::CalcInverseLowerValue(ZORVadSingleString& x) const {
  return CalcInverseFoldValue(x, &ZORString::ToLower);
}

int ZORVadSingleString::CalcUpperValue(const ZORVadSingleString& x) { return CalcFoldValue(x, &ZORString::ToUpper); }

int ZORVadSingleString::CalcInverseUpperValue(ZORVadSingleString& x) const {
  return CalcInverseFoldValue(x, &ZORString::ToUpper);
}

int ZORVadSingleString::CalcLowerValue(const ZORVaDoString& x) {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcLowerValue(a); });
}

int ZORVadSingleString::CalcInverseLowerValue(ZORVaDoString& x) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcInverseLowerValue(a); });
}

int ZORVadSingleString::CalcUpperValue(const ZORVaDoString& x) {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcUpperValue(a); });
}

int ZORVadSingleString::CalcInverseUpperValue(ZORVaDoString& x) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcInverseUpperValue(a); });
}
