// Texts of sets: testing, adding and removing them.
#include "enum/ZORVadEnumString.h"

int ZORVadEnumString::Contains(const ZORString& text) const { return Contains(&text); }

int ZORVadEnumString::Contains(const ZORString* text) const {
  if (mState == ZorStringAny) return 0;
  if (mState == ZorStringNil) return 0;
  if (mState == ZorStringMax && Count() == 0) return -1;
  const unsigned int position = mTexts.Find(text);
  return position <= mTexts.Count() ? static_cast<int>(position + 1) : 0;
}

int ZORVadEnumString::Insert(const ZORString& text) { return mTexts.Insert(text, OfEquals()) ? 1 : 0; }

int ZORVadEnumString::Append(const ZORVadEnumString& other) {
  if (other.Count() == 0) return 0;
  if (&other == this) return Append(ZORVadEnumString(other));
  return mTexts.Merge(other.mTexts.Vector(), OfEquals()) ? 1 : 0;
}

int ZORVadEnumString::Append(const ZORISVectorImp_String& texts) {
  int allNew = 1;
  for (ZORISVectorIteratorImp_String text(texts); text; ++text) allNew &= Insert(*text.Current());
  return allNew;
}

int ZORVadEnumString::Count() const { return static_cast<int>(mTexts.Count()); }

ZORString& ZORVadEnumString::GetValue(int position) const { return mTexts[static_cast<unsigned int>(position)]; }

void ZORVadEnumString::SetExactValue(const ZORString& text) { Become(ZorStringExact, text); }

// At the limit a listed text makes the value Undefined, too; a set that is larger already takes more.
void ZORVadEnumString::InsertExactValue(const ZORString& text) {
  if (IsUndefined() || IsFull()) return;
  if (mTexts.Count() == zor::kSetLimit) return SetUndefinedValue();
  Insert(text);
  mState = ZorStringExact;
}

int ZORVadEnumString::RemoveExactValue(const ZORString& text) {
  if (IsUndefined() || IsNil()) return 0;
  const unsigned int position = mTexts.Find(&text);
  if (position >= mTexts.Count()) return 0;
  mTexts.Cut(position, position + 1);
  if (Count() == 0 && mState == ZorStringExact) mState = ZorStringNil;
  return 1;
}
