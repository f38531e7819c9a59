// Binary searches and visits of the vector, and its iterator.
#include <algorithm>

#include "vector/ZORISVectorImp_String.h"

std::strong_ordering ZORISVectorImp_String::Order(const ZORString* a, const ZORString* b) {
  if (a == nullptr || b == nullptr) return (a != nullptr) <=> (b != nullptr);
  return *a <=> *b;
}

// Callers rely on which of several equal strings is found, so the steps must not change.
ZORISVectorImp_String::Meeting ZORISVectorImp_String::Bisect(const ZORString* s) const {
  Meeting met{Nowhere(), Nowhere(), Nowhere(), std::strong_ordering::equal};
  if (mTop == 0 || mItems == nullptr) return met;
  unsigned int low = 0, high = mTop - 1;
  while (low < high) {
    const unsigned int middle = low + (high - low) / 2;
    met.order = Order(mItems[middle], s);
    if (met.order == 0) {
      met.at = middle;
      return met;
    }
    if (met.order < 0) {
      met.below = middle;
      low = middle + 1;
    } else {
      met.above = middle;
      high = middle == 0 ? 0 : middle - 1;
    }
  }
  met.at = low;
  met.order = Order(mItems[low], s);
  return met;
}

unsigned int ZORISVectorImp_String::ClusterStart(unsigned int pos) const {
  if (pos >= mTop) return pos;
  unsigned int start = pos;
  while (start > 0 && Order(mItems[start - 1], mItems[pos]) == 0) --start;
  return start;
}

unsigned int ZORISVectorImp_String::Find(const ZORString* s) const {
  const Meeting met = Bisect(s);
  return met.order == 0 ? met.at : Nowhere();
}

unsigned int ZORISVectorImp_String::ClusteredFind(const ZORString* s) const { return ClusterStart(Find(s)); }

unsigned int ZORISVectorImp_String::FindLowerBound(const ZORString* s, int cluster) const {
  const Meeting met = Bisect(s);
  const unsigned int pos = met.order > 0 ? met.below : met.at;
  return cluster != 0 ? ClusterStart(pos) : pos;
}

unsigned int ZORISVectorImp_String::FindUpperBound(const ZORString* s, int cluster) const {
  const Meeting met = Bisect(s);
  const unsigned int pos = met.order < 0 ? met.above : met.at;
  return cluster != 0 ? ClusterStart(pos) : pos;
}

unsigned int ZORISVectorImp_String::Inside(unsigned int stop) const {
  return mItems == nullptr ? 0 : std::min(stop, mLimit);
}

void ZORISVectorImp_String::ForEach(Action f, void* arg, unsigned int first, unsigned int last) {
  for (unsigned int i = first; i < Inside(last); ++i)
    if (ZORString* s = mItems[i]) f(*s, arg);
}

void ZORISVectorImp_String::ForEach(Action f, void* arg) { ForEach(f, arg, 0, Count()); }

ZORString* ZORISVectorImp_String::FirstThat(Test f, void* arg, unsigned int first, unsigned int last) const {
  for (unsigned int i = first; i < Inside(last); ++i)
    if (ZORString* s = mItems[i]; s != nullptr && f(*s, arg) != 0) return s;
  return nullptr;
}

ZORString* ZORISVectorImp_String::FirstThat(Test f, void* arg) const { return FirstThat(f, arg, 0, Count()); }

ZORString* ZORISVectorImp_String::LastThat(Test f, void* arg, unsigned int first, unsigned int last) const {
  ZORString* found = nullptr;
  for (unsigned int i = first; i < Inside(last); ++i)
    if (ZORString* s = mItems[i]; s != nullptr && f(*s, arg) != 0) found = s;
  return found;
}

ZORString* ZORISVectorImp_String::LastThat(Test f, void* arg) const { return LastThat(f, arg, 0, Count()); }

ZORISVectorIteratorImp_String::ZORISVectorIteratorImp_String(const ZORISVectorImp_String& v)
    : ZORISVectorIteratorImp_String(v, 0, v.Top()) {}

ZORISVectorIteratorImp_String::ZORISVectorIteratorImp_String(const ZORISVectorImp_String& v, unsigned int from,
                                                             unsigned int to)
    : mVector(&v), mPosition(from), mStart(from), mStop(to) {}

ZORISVectorIteratorImp_String::ZORISVectorIteratorImp_String(const ZORISVectorIteratorImp_String&) = default;
ZORISVectorIteratorImp_String& ZORISVectorIteratorImp_String::operator=(const ZORISVectorIteratorImp_String&) = default;

ZORISVectorIteratorImp_String::operator int() const { return mVector->Good() != 0 && mPosition < mStop; }

ZORString* ZORISVectorIteratorImp_String::Current() const { return *this != 0 ? (*mVector)[mPosition] : nullptr; }

ZORString* ZORISVectorIteratorImp_String::operator++() {
  ++mPosition;
  return Current();
}

ZORString* ZORISVectorIteratorImp_String::operator++(int) {
  ZORString* current = Current();
  ++mPosition;
  return current;
}

void ZORISVectorIteratorImp_String::Restart(unsigned int from, unsigned int to) {
  mPosition = mStart = from;
  mStop = to;
}

void ZORISVectorIteratorImp_String::Restart() { Restart(mStart, mStop); }
