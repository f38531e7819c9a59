// Bounds of sets of texts, and texts one at a time.
#include "enum/insertion.h"

ZORString ZORVadEnumString::GetLowerBound() const {
  if (IsNil()) return ZorVaDoStringNil;
  if (IsUndefined() || IsEmpty()) return ZorVaDoStringMin;
  if (IsFull()) return ZorVaDoStringMax;
  return First();
}

ZORString ZORVadEnumString::GetUpperBound() const {
  if (IsNil()) return ZorVaDoStringNil;
  if (IsEmpty()) return ZorVaDoStringMin;
  if (IsUndefined() || mState == ZorStringMax) return ZorVaDoStringMax;
  return Last();
}

// Neither looks at the state, and a listed text that is not the last answers itself.
ZORString ZORVadEnumString::GetNextExactValue(const ZORString& text) const {
  const unsigned int position = mVector.FindUpperBound(&text, 0);
  if (position > mVector.Count()) return text;
  if (position == mVector.Count() - 1) return text;
  return *mVector[position];
}

ZORString ZORVadEnumString::GetPrevExactValue(const ZORString& text) const {
  const unsigned int position = mVector.FindLowerBound(&text, 0);
  if (position > mVector.Count()) return text;
  if (position == mVector.Count() - 1) return text;  // the last here too, not the first
  return *mVector[position];
}

void ZORVadEnumString::SetExactValue(const ZORString& text) { Become(ZorStringExact, text); }

void ZORVadEnumString::InsertExactValue(const ZORString& text) { PlaceExact(text); }

int ZORVadEnumString::RemoveExactValue(const ZORString& text) {
  if (IsUndefined() || IsNil()) return 0;
  const unsigned int position = mVector.Find(&text);
  if (position >= mVector.Count()) return 0;
  Remove(position, 1);
  if (Count() == 0 && mState == ZorStringExact) mState = ZorStringNil;
  return 1;
}

void ZORVadEnumString::SetLowerBound(const ZORString& text) {
  if (IsNil() || IsUndefined()) return;
  auto* const bound = new ZORString(text);  // before the removal: text may be one of ours
  Remove(0, CountUpTo(*bound));
  Store(bound, 0);
}

void ZORVadEnumString::SetUpperBound(const ZORString& text) {
  auto* const bound = new ZORString(text);
  mState = *bound < ZorVaDoStringMax ? ZorStringExact : ZorStringMax;
  const unsigned int kept = CountBelow(mVector, *bound);
  Remove(kept, mVector.Count() - kept);
  Store(bound, kept);
}
