// The listed texts: what is among them, what is added and what is dropped.
#include <algorithm>
#include <cstdio>
#include <cstdlib>

#include "enum/insertion.h"

namespace {

// A set that silently lost a text would be a wrong answer.
void Require(int stored) {
  if (stored) return;
  std::fputs("ZORVadStrings: no memory for a set of texts\n", stderr);
  std::abort();
}

}  // namespace

// Bisections over texts in order.
unsigned int ZORVadEnumString::CountBelow(const ZORISVectorImp_String& texts, const ZORString& text) {
  ZORString* const* const places = &texts[0];
  const auto below = [](const ZORString* listed, const ZORString& bound) { return *listed < bound; };
  return static_cast<unsigned int>(std::lower_bound(places, places + texts.Count(), text, below) - places);
}

unsigned int ZORVadEnumString::CountUpTo(const ZORString& text) const {
  ZORString* const* const places = &mVector[0];
  const auto above = [](const ZORString& bound, const ZORString* listed) { return bound < *listed; };
  return static_cast<unsigned int>(std::upper_bound(places, places + mVector.Count(), text, above) - places);
}

void ZORVadEnumString::Reserve(unsigned int places) {
  Require(mVector.Good());
  if (places > mVector.Limit()) Require(mVector.Resize(places));
}

// Takes over text; the places grow by half so that building a large set stays linear.
void ZORVadEnumString::Store(ZORString* text, unsigned int position) {
  const unsigned int count = mVector.Count();
  if (count == mVector.Limit()) Reserve(count + count / 2 + 1);
  Require(mVector.AddAt(text, position));
}

void ZORVadEnumString::StoreLast(const ZORString& text) { Store(new ZORString(text), mVector.Count()); }

void ZORVadEnumString::Remove(unsigned int position, unsigned int count) {
  if (count > 0) mVector.DetachAt(position, count, 1);
}

int ZORVadEnumString::Contains(const ZORString& text) const { return Contains(&text); }

int ZORVadEnumString::Contains(const ZORString* text) const {
  if (IsUndefined()) return 0;
  if (IsNil()) return 0;
  if (IsFull()) return -1;
  const unsigned int position = mVector.Find(text);
  return position <= mVector.Count() ? static_cast<int>(position + 1) : 0;
}

int ZORVadEnumString::Insert(const ZORString& text) { return Place(text); }

int ZORVadEnumString::Append(const ZORVadEnumString& other) {
  if (other.Count() == 0) return 0;
  if (&other == this) return Append(ZORVadEnumString(other));
  return Merge(other.mVector);
}

int ZORVadEnumString::Append(const ZORISVectorImp_String& texts) {
  int allNew = 1;
  for (ZORISVectorIteratorImp_String text(texts); text; ++text) allNew &= Insert(*text.Current());
  return allNew;
}

int ZORVadEnumString::Count() const { return static_cast<int>(mVector.Count()); }

ZORString& ZORVadEnumString::GetValue(int position) const { return *mVector[static_cast<unsigned int>(position)]; }

int ZORVadEnumString::CutLower(const ZORString& bound) {
  Remove(0, CountBelow(mVector, bound));
  if (mState == ZorStringExact && Count() == 0) mState = ZorStringNil;
  return Count();
}

int ZORVadEnumString::CutUpper(const ZORString& bound) {
  if (bound < ZorVaDoStringMax) mState = ZorStringExact;
  const unsigned int kept = CountUpTo(bound);
  Remove(kept, mVector.Count() - kept);
  if (mState == ZorStringExact && Count() == 0) mState = ZorStringNil;
  return Count();
}

int ZORVadEnumString::CalcMinValue() {
  if (IsEmpty()) return 0;
  return Become(ZorStringExact, "");
}

int ZORVadEnumString::CalcMaxValue() {
  if (IsFull()) return 0;
  return Become(ZorStringMax);
}
