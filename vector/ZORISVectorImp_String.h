// The ordered container behind sets of strings, and its iterator.
#pragma once

#include <compare>

#include "host/ZORExport.h"
#include "host/ZORText.h"

// An array of ZORString pointers, positions from 0. It owns the array but no string: strings are deleted only by Flush,
// Detach and DetachAt with del != 0; the destructor frees just the array, and copies share the strings.
// Top() <= Limit(). Elements are the positions below top; they ascend, equal ones adjacent, as long as only Add and
// AddUnique insert. A null element, which AddAt can leave, orders before every string. Positions from top to limit are
// null, except those that a Flush of a part of the range leaves.
// A vector whose array could not be allocated is not Good: it finds, visits and stores nothing and does not grow,
// whatever Limit() says.
class ZOR_EXPORT ZORISVectorImp_String {
 public:
  using Action = void (*)(ZORString& s, void* arg);
  using Test = int (*)(const ZORString& s, void* arg);

  // With a size, the capacity is size + 1 and grows by multiples of delta, or by ratio times the limit at each step; a
  // ratio that is not positive counts as 1.0. Without a size, or with delta 0, a vector cannot grow.
  ZORISVectorImp_String();
  ZORISVectorImp_String(unsigned int size, unsigned int delta);
  ZORISVectorImp_String(unsigned int size, double ratio);

  // Copies the array. Assignment copies the growth too, and from a vector that is not Good that flag alone; when
  // allocation fails, the target has no array, limit and top 0, and is not Good.
  ZORISVectorImp_String(const ZORISVectorImp_String& other);
  const ZORISVectorImp_String& operator=(const ZORISVectorImp_String& other);

  void Swap(ZORISVectorImp_String& other) noexcept;  // exchanges everything

  ZORString*& operator[](unsigned int pos);  // pos < Limit(), unchecked
  ZORString*& operator[](unsigned int pos) const;

  // clang-format off
  virtual ~ZORISVectorImp_String();
  virtual int          Good() const;
  virtual int          Good();

  // 1: s is stored, and whoever flushes the vector deletes it. 0: allocation failed, the vector is unchanged and the
  // caller keeps s. AddUnique also returns 1 for a string that is present; the caller then keeps s, too.
  virtual int          Add      (ZORString* s);                    // after its equals
  virtual int          AddAt    (ZORString* s, unsigned int pos);  // ignores the order; pos > top extends the elements to pos
  virtual int          AddUnique(ZORString* s);

  // 1 removed, 0 no such string or position. del != 0 deletes the strings. DetachAt stops at top, whatever the count;
  // at or after top it returns 1 and only sets positions to null.
  virtual int          Detach   (const ZORString* s, int del);
  virtual int          DetachAt (unsigned int pos, unsigned int count, int del);
  virtual int          IsEmpty  () const;

  // Sets [start, stop) to null, deleting the strings for del != 0; afterwards top is 0, whatever the range.
  virtual void         Flush    (int del, unsigned int stop, unsigned int start);
  virtual void         Flush    (int del);

  // Binary searches. They return a position, or Limit() + 1 when there is none, which is greater than Count(). *s need
  // not be in the vector. Of equal strings any may be found; ClusteredFind and cluster != 0 return the first.
  virtual unsigned int Find          (const ZORString* s) const;
  virtual unsigned int ClusteredFind (const ZORString* s) const;
  virtual unsigned int FindLowerBound(const ZORString* s, int cluster) const;  // the last string <= *s
  virtual unsigned int FindUpperBound(const ZORString* s, int cluster) const;  // the first string >= *s

  virtual unsigned int Limit() const;
  virtual unsigned int Top  () const;
  virtual unsigned int Count() const;  // the same as Top

  // Growth. NextDelta: by how much the capacity grows to fit needed more, UINT_MAX on overflow. Resize: 1 grown, in one
  // allocation; 0 nothing changed, because the capacity suffices, cannot grow, or allocation failed.
  virtual unsigned int GetDelta () const;
  virtual unsigned int NextDelta(unsigned int needed);
  virtual int          Resize   (unsigned int wanted);

  // Visit [first, last), or all elements, except null ones. FirstThat and LastThat return the first and the last string
  // for which f is not 0, or null; LastThat calls f on all of them.
  virtual void         ForEach  (Action f, void* arg, unsigned int first, unsigned int last);
  virtual void         ForEach  (Action f, void* arg);
  virtual ZORString*   FirstThat(Test f, void* arg, unsigned int first, unsigned int last) const;
  virtual ZORString*   FirstThat(Test f, void* arg) const;
  virtual ZORString*   LastThat (Test f, void* arg, unsigned int first, unsigned int last) const;
  virtual ZORString*   LastThat (Test f, void* arg) const;

 protected:
  virtual void         Zero     (unsigned int start, unsigned int stop);  // sets [start, stop) to null, up to the limit
  // clang-format on

 private:
  // Where a binary search ended, how the string there compares with s, and the nearest strings compared on either
  // side. Each position is Nowhere() when there is none.
  struct Meeting {
    unsigned int at, below, above;
    std::strong_ordering order;
  };

  static void DelObj(ZORString& s, void*);
  static ZORString** NewPlaces(unsigned int limit);
  static std::strong_ordering Order(const ZORString* a, const ZORString* b);

  void TakeOver(const ZORISVectorImp_String& other);
  unsigned int Inside(unsigned int stop) const;
  unsigned int PlaceFor(const ZORString* s) const;
  unsigned int ClusterStart(unsigned int pos) const;
  unsigned int Nowhere() const { return mLimit + 1; }
  Meeting Bisect(const ZORString* s) const;

  ZORString** mItems;
  unsigned int mLimit;
  unsigned int mTop;
  unsigned int mDelta;
  int mGood;
  double mRatio;
};

inline ZORString*& ZORISVectorImp_String::operator[](unsigned int pos) { return mItems[pos]; }
inline ZORString*& ZORISVectorImp_String::operator[](unsigned int pos) const { return mItems[pos]; }
inline int ZORISVectorImp_String::Good() const { return mGood; }
inline int ZORISVectorImp_String::Good() { return mGood; }
inline int ZORISVectorImp_String::IsEmpty() const { return mTop == 0; }
inline unsigned int ZORISVectorImp_String::Limit() const { return mLimit; }
inline unsigned int ZORISVectorImp_String::Top() const { return mTop; }
inline unsigned int ZORISVectorImp_String::Count() const { return mTop; }
inline unsigned int ZORISVectorImp_String::GetDelta() const { return mDelta; }

// An iterator over a vector, which must outlive it. The range is fixed when the iterator is constructed or restarted;
// it must lie within the vector's limit, and does not grow with the vector.
//   for (ZORISVectorIteratorImp_String i(v); i; ++i) Use(*i.Current());
class ZOR_EXPORT ZORISVectorIteratorImp_String {
 public:
  explicit ZORISVectorIteratorImp_String(const ZORISVectorImp_String& v);                             // all elements
  ZORISVectorIteratorImp_String(const ZORISVectorImp_String& v, unsigned int from, unsigned int to);  // [from, to)
  ZORISVectorIteratorImp_String(const ZORISVectorIteratorImp_String& other);
  ZORISVectorIteratorImp_String& operator=(const ZORISVectorIteratorImp_String& other);

  operator int() const;        // NOLINT(google-explicit-constructor): 1 until the end, then 0
  ZORString* operator++();     // advances, returns Current()
  ZORString* operator++(int);  // returns Current(), then advances, even past the end

  virtual ZORString* Current() const;  // null at the end, for a vector that is not Good, and for a null element
  virtual void Restart(unsigned int from, unsigned int to);
  virtual void Restart();  // with the same range

 private:
  const ZORISVectorImp_String* mVector;
  unsigned int mPosition;
  unsigned int mStart;
  unsigned int mStop;
};
