// Bounds of sets of texts.
#include <utility>

#include "enum/ZORVadEnumString.h"

ZORString ZORVadEnumString::GetLowerBound() const {
  if (IsNil()) return ZorVaDoStringNil;
  if (IsUndefined() || IsEmpty()) return ZorVaDoStringMin;
  if (IsFull()) return ZorVaDoStringMax;
  return mTexts.First();
}

ZORString ZORVadEnumString::GetUpperBound() const {
  if (IsNil()) return ZorVaDoStringNil;
  if (IsEmpty()) return ZorVaDoStringMin;
  if (IsUndefined() || mState == ZorStringMax) return ZorVaDoStringMax;
  return mTexts.Last();
}

// Both ignore the state. A listed text that is not the last is its own neighbour.
ZORString ZORVadEnumString::GetNextExactValue(const ZORString& text) const {
  const unsigned int position = mTexts.FindUpperBound(text);
  if (position > mTexts.Count()) return text;
  if (position == mTexts.Count() - 1) return text;
  return mTexts[position];
}

ZORString ZORVadEnumString::GetPrevExactValue(const ZORString& text) const {
  const unsigned int position = mTexts.FindLowerBound(text);
  if (position > mTexts.Count()) return text;
  if (position == mTexts.Count() - 1) return text;  // the last, not the first, here too
  return mTexts[position];
}

int ZORVadEnumString::CutLower(const ZORString& bound) {
  mTexts.Cut(0, mTexts.CountLess(bound));
  if (mState == ZorStringExact && Count() == 0) mState = ZorStringNil;
  return Count();
}

int ZORVadEnumString::CutUpper(const ZORString& bound) {
  if (bound < ZorVaDoStringMax) mState = ZorStringExact;
  mTexts.Cut(mTexts.CountLessOrEqual(bound), mTexts.Count());
  if (mState == ZorStringExact && Count() == 0) mState = ZorStringNil;
  return Count();
}

void ZORVadEnumString::SetLowerBound(const ZORString& text) {
  if (IsNil() || IsUndefined()) return;
  ZORString bound(text);  // text may be one of those that Cut deletes
  mTexts.Cut(0, mTexts.CountLessOrEqual(bound));
  mTexts.Insert(std::move(bound));
}

void ZORVadEnumString::SetUpperBound(const ZORString& text) {
  ZORString bound(text);
  mState = bound < ZorVaDoStringMax ? ZorStringExact : ZorStringMax;
  mTexts.Cut(mTexts.CountLess(bound), mTexts.Count());
  mTexts.Insert(std::move(bound));
}
