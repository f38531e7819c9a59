// The ordered container behind sets of strings, and a cursor over it.
#pragma once

#include <compare>

#include "host/ZORExport.h"
#include "host/ZORText.h"

// Places for ZORString pointers, counted from 0. Owns its array and no string: strings that are not deleted through
// a flag of Flush, Detach or DetachAt are the user's, the destructor frees the array alone, copies share the strings.
// Top() <= Limit(). Places below top count; they ascend, equal ones side by side, as long as only Add and AddUnique
// fill them. A null place, which AddAt can leave, orders before every string. Places from top to limit are null,
// but for those that a Flush of a part of the range leaves.
// A vector whose array could not be had is not Good. It may still tell a limit, but has no place: nothing is found,
// walked or stored in it, and it does not grow.
class ZOR_EXPORT ZORISVectorImp_String {
 public:
  using Action = void (*)(ZORString& s, void* arg);
  using Test = int (*)(const ZORString& s, void* arg);

  // The sized ones have size + 1 places and grow by multiples of delta, or by ratio times the limit at each step;
  // a ratio that is not above 0.0 counts as 1.0. A vector made without a size, or with delta 0, cannot grow.
  ZORISVectorImp_String();
  ZORISVectorImp_String(unsigned int size, unsigned int delta);
  ZORISVectorImp_String(unsigned int size, double ratio);

  // The array is copied. Assignment takes over the growth as well, and from a vector that is not Good the flag alone;
  // when the new array cannot be had, the target is left without one, limit and top 0, and not Good.
  ZORISVectorImp_String(const ZORISVectorImp_String& other);
  const ZORISVectorImp_String& operator=(const ZORISVectorImp_String& other);

  void Swap(ZORISVectorImp_String& other) noexcept;  // places, growth and all

  ZORString*& operator[](unsigned int pos);  // below Limit(), untested
  ZORString*& operator[](unsigned int pos) const;

  // clang-format off
  virtual ~ZORISVectorImp_String();
  virtual int          Good() const;
  virtual int          Good();

  // 1: s is stored and belongs to whoever flushes the vector. 0: no place to be had, the vector is as before and s
  // stays the caller's. AddUnique answers 1 for a string that is there too, and s stays the caller's then as well.
  virtual int          Add      (ZORString* s);                    // behind its equals
  virtual int          AddAt    (ZORString* s, unsigned int pos);  // whatever the order; above top, all up to pos count
  virtual int          AddUnique(ZORString* s);

  // 1 removed, 0 no such string or place. del != 0 deletes the strings. DetachAt removes up to top at most, whatever
  // the count; from a place behind top it answers 1 and empties places only.
  virtual int          Detach   (const ZORString* s, int del);
  virtual int          DetachAt (unsigned int pos, unsigned int count, int del);
  virtual int          IsEmpty  () const;

  // Empties the places from start up to stop, not including it; afterwards none counts, whatever the range was.
  virtual void         Flush    (int del, unsigned int stop, unsigned int start);
  virtual void         Flush    (int del);

  // Positions; above Count(), namely Limit() + 1, when there is none. *s is read only and need not be in the vector.
  // Of equal strings any may be met; ClusteredFind and cluster != 0 answer the first of them.
  virtual unsigned int Find          (const ZORString* s) const;
  virtual unsigned int ClusteredFind (const ZORString* s) const;
  virtual unsigned int FindLowerBound(const ZORString* s, int cluster) const;  // the last string <= *s
  virtual unsigned int FindUpperBound(const ZORString* s, int cluster) const;  // the first string >= *s

  virtual unsigned int Limit() const;
  virtual unsigned int Top  () const;
  virtual unsigned int Count() const;  // the same as Top

  // Growth. NextDelta: how many places come to it so that needed more fit, UINT_MAX when that is beyond counting.
  // Resize: 1 grown, in one allocation; 0 wanted is there already or cannot be had, nothing changed.
  virtual unsigned int GetDelta () const;
  virtual unsigned int NextDelta(unsigned int needed);
  virtual int          Resize   (unsigned int wanted);

  // Walk the places from first up to last, not including it, and skip null ones; without a range those that count.
  // LastThat tests all of them. FirstThat and LastThat answer null when f answers 0 throughout.
  virtual void         ForEach  (Action f, void* arg, unsigned int first, unsigned int last);
  virtual void         ForEach  (Action f, void* arg);
  virtual ZORString*   FirstThat(Test f, void* arg, unsigned int first, unsigned int last) const;
  virtual ZORString*   FirstThat(Test f, void* arg) const;
  virtual ZORString*   LastThat (Test f, void* arg, unsigned int first, unsigned int last) const;
  virtual ZORString*   LastThat (Test f, void* arg) const;

 protected:
  virtual void         Zero     (unsigned int start, unsigned int stop);  // empties places, capped at the limit
  // clang-format on

 private:
  // Where a bisection ended, how the string there compares with the one sought, and the nearest strings that it met
  // on either side. Each is the not-found answer when there is none.
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
  double mRatio;
  int mGood;
};

// Inline, and exported to programs that do not inline them.
ZOR_EXPORT inline ZORString*& ZORISVectorImp_String::operator[](unsigned int pos) { return mItems[pos]; }
ZOR_EXPORT inline ZORString*& ZORISVectorImp_String::operator[](unsigned int pos) const { return mItems[pos]; }
ZOR_EXPORT inline int ZORISVectorImp_String::Good() const { return mGood; }
ZOR_EXPORT inline int ZORISVectorImp_String::Good() { return mGood; }
ZOR_EXPORT inline int ZORISVectorImp_String::IsEmpty() const { return mTop == 0; }
ZOR_EXPORT inline unsigned int ZORISVectorImp_String::Limit() const { return mLimit; }
ZOR_EXPORT inline unsigned int ZORISVectorImp_String::Top() const { return mTop; }
ZOR_EXPORT inline unsigned int ZORISVectorImp_String::Count() const { return mTop; }
ZOR_EXPORT inline unsigned int ZORISVectorImp_String::GetDelta() const { return mDelta; }

// A cursor over a vector, which it does not own. The end of the walk is fixed when it is made or restarted: strings
// added behind it meanwhile stay outside. It must lie within the vector's limit.
//   for (ZORISVectorIteratorImp_String i(v); i; ++i) Use(*i.Current());
class ZOR_EXPORT ZORISVectorIteratorImp_String {
 public:
  explicit ZORISVectorIteratorImp_String(const ZORISVectorImp_String& v);  // the places that count now
  ZORISVectorIteratorImp_String(const ZORISVectorImp_String& v, unsigned int from, unsigned int to);  // to not included
  ZORISVectorIteratorImp_String(const ZORISVectorIteratorImp_String& other);
  ZORISVectorIteratorImp_String& operator=(const ZORISVectorIteratorImp_String& other);

  operator int() const;        // NOLINT(google-explicit-constructor): 1 while there is a place to walk, else 0
  ZORString* operator++();     // steps, then answers Current()
  ZORString* operator++(int);  // answers Current() as it was, and steps also at the end

  virtual ZORString* Current() const;  // null at the end, over a vector that is not Good, and for a null place
  virtual void Restart(unsigned int from, unsigned int to);
  virtual void Restart();  // the range as it was given

 private:
  const ZORISVectorImp_String* mVector;
  unsigned int mPosition;
  unsigned int mStart;
  unsigned int mStop;
};
