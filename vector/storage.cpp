// Construction, copying, growth, insertion and removal.
#include <algorithm>
#include <climits>
#include <cstdint>
#include <new>
#include <utility>

#include "vector/ZORISVectorImp_String.h"

namespace {

// Leaves Limit() + 1 free, the result of a search that finds nothing.
constexpr unsigned int kMostPlaces = UINT_MAX - 1;

unsigned int Saturated(std::uint64_t count) {
  return static_cast<unsigned int>(std::min<std::uint64_t>(count, UINT_MAX));
}

// Emits the inline operators for programs that do not inline them.
using Places = ZORString*& (ZORISVectorImp_String::*)(unsigned int);
using ConstPlaces = ZORString*& (ZORISVectorImp_String::*)(unsigned int) const;
[[gnu::used]] constexpr Places kPlaces = &ZORISVectorImp_String::operator[];
[[gnu::used]] constexpr ConstPlaces kConstPlaces = &ZORISVectorImp_String::operator[];

}  // namespace

ZORString** ZORISVectorImp_String::NewPlaces(unsigned int limit) {
  return limit > kMostPlaces ? nullptr : new (std::nothrow) ZORString* [limit] {};
}

void ZORISVectorImp_String::DelObj(ZORString& s, void*) { delete &s; }

ZORISVectorImp_String::ZORISVectorImp_String()
    : mItems(nullptr), mLimit(0), mTop(0), mDelta(0), mGood(1), mRatio(0.0) {}

ZORISVectorImp_String::ZORISVectorImp_String(unsigned int size, unsigned int delta)
    : mItems(NewPlaces(size + 1)), mLimit(size + 1), mTop(0), mDelta(delta), mGood(mItems != nullptr), mRatio(0.0) {}

ZORISVectorImp_String::ZORISVectorImp_String(unsigned int size, double ratio) : ZORISVectorImp_String(size, 0u) {
  mRatio = ratio > 0.0 ? ratio : 1.0;
}

ZORISVectorImp_String::ZORISVectorImp_String(const ZORISVectorImp_String& other)
    : mItems(NewPlaces(other.mLimit)),
      mLimit(other.mLimit),
      mTop(other.mTop),
      mDelta(other.mDelta),
      mGood(mItems != nullptr ? other.Good() : 0),
      mRatio(other.mRatio) {
  if (mGood != 0) std::copy_n(other.mItems, mLimit, mItems);
}

const ZORISVectorImp_String& ZORISVectorImp_String::operator=(const ZORISVectorImp_String& other) {
  if (this == &other) return *this;
  mGood = other.Good();
  if (mGood != 0) TakeOver(other);
  return *this;
}

void ZORISVectorImp_String::TakeOver(const ZORISVectorImp_String& other) {
  delete[] mItems;
  mItems = NewPlaces(other.mLimit);
  if (mItems == nullptr) mGood = 0;
  mLimit = mGood != 0 ? other.mLimit : 0;
  mTop = mGood != 0 ? other.mTop : 0;
  mDelta = other.mDelta;
  mRatio = other.mRatio;
  std::copy_n(other.mItems, mLimit, mItems);
}

ZORISVectorImp_String::~ZORISVectorImp_String() { delete[] mItems; }

unsigned int ZORISVectorImp_String::NextDelta(unsigned int needed) {
  if (mRatio == 0.0) {
    if (mDelta == 0 || needed % mDelta == 0) return mDelta == 0 ? 0 : needed;
    return Saturated((std::uint64_t{mDelta} + needed) / mDelta * mDelta);
  }
  std::uint64_t places = std::max(mLimit, 1u);
  const std::uint64_t wanted = std::uint64_t{mLimit} + needed;
  while (places < wanted) {
    const double step = std::min(static_cast<double>(places) * mRatio, double{UINT_MAX});
    places += std::max<std::uint64_t>(static_cast<std::uint64_t>(step), 1);
  }
  return Saturated(places - mLimit);
}

int ZORISVectorImp_String::Resize(unsigned int wanted) {
  if (wanted <= mLimit) return 0;
  if (GetDelta() == 0 && mRatio == 0.0) return 0;
  if (mItems == nullptr) return 0;
  const unsigned int extra = NextDelta(wanted - mLimit);
  if (extra > kMostPlaces - mLimit) return 0;
  auto** items = new (std::nothrow) ZORString*[mLimit + extra];
  if (items == nullptr) return 0;
  std::fill_n(std::copy_n(mItems, mLimit, items), extra, nullptr);
  delete[] std::exchange(mItems, items);
  mLimit += extra;
  return 1;
}

// After the last string <= *s. Strings mostly arrive in ascending order, so the end is tried first.
unsigned int ZORISVectorImp_String::PlaceFor(const ZORString* s) const {
  const auto below = [](const ZORString* a, const ZORString* b) { return Order(a, b) < 0; };
  if (mTop == 0 || !below(s, mItems[mTop - 1])) return mTop;
  return static_cast<unsigned int>(std::upper_bound(mItems, mItems + mTop - 1, s, below) - mItems);
}

int ZORISVectorImp_String::Add(ZORString* s) {
  if (mItems == nullptr) return 0;
  if (mTop == mLimit && Resize(mTop + 1) == 0) return 0;
  const unsigned int pos = PlaceFor(s);
  std::copy_backward(mItems + pos, mItems + mTop, mItems + mTop + 1);
  mItems[pos] = s;
  ++mTop;
  return 1;
}

int ZORISVectorImp_String::AddAt(ZORString* s, unsigned int pos) {
  if (mItems == nullptr) return 0;
  if (pos >= mLimit && Resize(pos + 1) == 0) return 0;
  if (mTop == mLimit && Resize(mLimit + 1) == 0) return 0;
  if (pos > mTop) mTop = pos;
  std::copy_backward(mItems + pos, mItems + mTop, mItems + mTop + 1);
  mItems[pos] = s;
  ++mTop;
  return 1;
}

int ZORISVectorImp_String::AddUnique(ZORString* s) {
  const unsigned int i = FindLowerBound(s, 0);
  if (i >= Count()) return Add(s);
  if (Order(mItems[i], s) == 0) return 1;
  return AddAt(s, i + 1);  // i is the last string < *s
}

int ZORISVectorImp_String::Detach(const ZORString* s, int del) { return DetachAt(Find(s), 1, del); }

// Deleted positions become null at once: those after top, which a partial Flush leaves, are not reached below.
int ZORISVectorImp_String::DetachAt(unsigned int pos, unsigned int count, int del) {
  if (mItems == nullptr || pos >= mLimit) return 0;
  const unsigned int end = pos + std::min(count, mLimit - pos);
  if (del != 0) {
    ZORString::DeleteAll(mItems + pos, end - pos);
    std::fill(mItems + pos, mItems + end, nullptr);
  }
  if (pos >= mTop) {
    Zero(pos, end);
    return 1;
  }
  const unsigned int removed = std::min(count, mTop - pos);
  std::copy(mItems + pos + removed, mItems + mTop, mItems + pos);
  mTop -= removed;
  Zero(mTop, mTop + removed);
  return 1;
}

void ZORISVectorImp_String::Flush(int del) { Flush(del, Limit(), 0); }

void ZORISVectorImp_String::Flush(int del, unsigned int stop, unsigned int start) {
  stop = std::min(stop, Limit());
  if (del != 0) ForEach(DelObj, nullptr, start, stop);
  Zero(start, stop);
  mTop = 0;
}

void ZORISVectorImp_String::Swap(ZORISVectorImp_String& other) noexcept {
  std::swap(mItems, other.mItems);
  std::swap(mLimit, other.mLimit);
  std::swap(mTop, other.mTop);
  std::swap(mDelta, other.mDelta);
  std::swap(mRatio, other.mRatio);
  std::swap(mGood, other.mGood);
}

void ZORISVectorImp_String::Zero(unsigned int start, unsigned int stop) {
  stop = Inside(stop);
  if (start < stop) std::fill(mItems + start, mItems + stop, nullptr);
}
