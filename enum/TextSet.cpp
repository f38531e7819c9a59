#include "enum/TextSet.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>

namespace zor {

namespace {

constexpr unsigned int kAhead = 8;    // how many texts ahead of the current one are prefetched
constexpr unsigned int kSearch = 16;  // a set that many times larger is searched, not walked

// Prefetches the text kAhead positions after i.
void FetchAhead(ZORString* const* places, unsigned int i, unsigned int count) {
  if (i + kAhead < count) __builtin_prefetch(places[i + kAhead]);
}

}  // namespace

void TextSet::Die() {
  std::fputs("ZORVadStrings: no memory for a set of texts\n", stderr);
  std::abort();
}

// A vector without an array never gets one, so the first is that of another vector.
void TextSet::Reserve(unsigned int places) {
  if (places <= mVector.Limit()) return;
  if (mVector.Limit() > 0) return Require(mVector.Resize(places));
  ZORISVectorImp_String first(std::max(places, kFirst) - 1, kMore);
  Require(first.Good());
  mVector.Swap(first);
}

void TextSet::DeleteAll() { ZORString::DeleteAll(PlacesOf(mVector), Count()); }

unsigned int TextSet::CountLessOrEqual(const ZORString& bound) const {
  const std::span<const ZORString* const> texts = All();
  const auto less = [](const ZORString& limit, const ZORString* listed) { return limit < *listed; };
  const ZORString* const* const first = texts.data();
  return static_cast<unsigned int>(std::upper_bound(first, first + texts.size(), bound, less) - first);
}

// Exponential search (Bentley and Yao, 1976): doubles its steps from near until they pass bound, then bisects the last.
unsigned int TextSet::CountLess(const ZORString& bound, unsigned int near) const {
  const std::span<const ZORString* const> texts = All();
  unsigned int low = 0, high = Count();
  if (near < high && *texts[near] < bound) {
    low = near + 1;
    for (unsigned int step = 1; step <= high - low; step *= 2) {
      if (*texts[low + step - 1] < bound) {
        low += step;
      } else {
        high = low + step - 1;
      }
    }
  } else {
    high = std::min(near, high);
    for (unsigned int step = 1; step <= high - low; step *= 2) {
      if (*texts[high - step] < bound) {
        low = high - step + 1;
      } else {
        high -= step;
      }
    }
  }
  return low + CountLess(texts.subspan(low, high - low), bound);
}

// Moves the own texts to the end of an array with room for all, then merges both runs into its front, which cannot
// overtake them.
bool TextSet::Merge(const ZORISVectorImp_String& texts, Equals equals) {
  const unsigned int own = Count(), more = texts.Count();
  const bool refuses = equals == Equals::Refused;
  Reserve(own + more);
  ZORString** const places = PlacesOf(mVector);
  ZORString** next = places + more;
  ZORString** const end = next + own;
  std::copy_backward(places, places + own, end);

  ZORString** out = places;
  const ZORString* added = nullptr;
  for (unsigned int i = 0; i < more; ++i) {
    FetchAhead(PlacesOf(texts), i, more);
    const ZORString& text = *texts[i];
    std::strong_ordering order = std::strong_ordering::greater;
    while (next != end && ((order = **next <=> text) < 0 || (order == 0 && !refuses))) *out++ = *next++;
    const bool listed = (next != end && order == 0) || (added != nullptr && *added == text);
    if (!listed || !refuses) added = *out++ = new ZORString(text);
  }
  while (next != end) *out++ = *next++;
  const auto count = static_cast<unsigned int>(out - places);
  if (count > own) mVector.AddAt(places[count - 1], count - 1);  // already there: extends the elements up to it
  mVector.DetachAt(count, own + more - count, 0);
  return count == own + more;
}

// One pass without allocation: a dropped text is deleted at once, and later ones move up.
template <class Test>
bool TextSet::KeepThose(Test test) {
  const unsigned int count = Count();
  ZORString** const places = PlacesOf(mVector);
  unsigned int kept = 0;
  for (unsigned int i = 0; i < count; ++i) {
    if (test(i)) {
      places[kept++] = places[i];
    } else {
      delete places[i];
    }
  }
  if (kept == count) return false;
  mVector.DetachAt(kept, count - kept, 0);
  return true;
}

bool TextSet::Keep(const ZORISVectorImp_String& others) {
  const unsigned int count = Count(), otherCount = others.Count();
  ZORString* const* const places = PlacesOf(mVector);
  ZORString* const* const otherPlaces = PlacesOf(others);
  const bool searches = otherCount / kSearch > count;
  unsigned int j = 0;
  return KeepThose([&](unsigned int i) {
    FetchAhead(places, i, count);
    if (searches) j = std::max(j, CountLess({otherPlaces, otherCount}, *places[i]));
    std::strong_ordering order = std::strong_ordering::less;
    while (j < otherCount && (order = *places[i] <=> *otherPlaces[j]) > 0) FetchAhead(otherPlaces, ++j, otherCount);
    const bool isListed = j < otherCount && order == 0;
    j += isListed ? 1 : 0;
    return isListed;
  });
}

bool TextSet::Keep(const Marks& marks) {
  return marks.count() < Count() && KeepThose([&](unsigned int i) { return marks[i]; });
}

void TextSet::Mark(const ZORString& text, Marks& marks, unsigned int& near) const {
  near = CountLess(text, near);
  if (near < Count() && (*this)[near] == text) marks.set(near++);
}

}  // namespace zor
