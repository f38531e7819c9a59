// The ordered texts behind a value of ZORVadEnumString. Not exported: programs see it as a member and never call it.
#pragma once

#include <algorithm>
#include <bitset>
#include <compare>
#include <cstddef>
#include <span>
#include <utility>

#include "module/texts.h"
#include "vector/ZORISVectorImp_String.h"

namespace zor {

// Texts in ascending order, each an object of the set's own, counted from 0. Texts are copied in, or moved when they
// are given away. Equal ones stand side by side where they were let in on purpose. The places grow by half, so that
// building a large set stays linear. Memory that cannot be had ends the process: a lost text would be a wrong answer.
class TextSet {
 public:
  enum class Equals { Refused, Accepted };  // what becomes of a text that is listed already
  using Marks = std::bitset<kSetLimit>;     // of positions

  // Places for as many texts, up to the limit of a set.
  explicit TextSet(std::size_t expected = kFew)
      : mVector(static_cast<unsigned int>(std::min(expected, kSetLimit)), kFew) {}
  ~TextSet() { Clear(); }
  TextSet(const TextSet&) = delete;
  TextSet& operator=(const TextSet&) = delete;

  // clang-format off
  unsigned int Count     () const { return mVector.Count(); }
  ZORString&   operator[](unsigned int position) const { return *mVector[position]; }
  ZORString&   First     () const { return *mVector[0]; }
  ZORString&   Last      () const { return *mVector[Count() - 1]; }

  // The same texts as a vector, and as pointers to walk over.
  const ZORISVectorImp_String& Vector() const { return mVector; }
  std::span<const ZORString* const> All() const { return {&mVector[0], Count()}; }

  // Positions, above Count() when there is none: see the vector. How many texts are less, and less or equal.
  unsigned int Find            (const ZORString* text)  const { return mVector.Find(text); }
  unsigned int FindLowerBound  (const ZORString& text)  const { return mVector.FindLowerBound(&text, 0); }
  unsigned int FindUpperBound  (const ZORString& text)  const { return mVector.FindUpperBound(&text, 0); }
  unsigned int CountLess       (const ZORString& bound) const;
  unsigned int CountLessOrEqual(const ZORString& bound) const;

  // Insert answers whether text came in; of equal ones it is the last. Merge inserts texts in order, and answers
  // whether all of them came in.
  template <class Text>
  bool Insert(Text&& text, Equals equals = Equals::Refused);
  bool Merge (const ZORISVectorImp_String& texts, Equals equals);

  // Drop texts where they are: Keep those that are not among others, or not marked, and answers whether there were
  // any; Cut those from position first up to last, not including it.
  bool Keep (const ZORISVectorImp_String& others);
  bool Keep (const Marks& marks);
  void Cut  (unsigned int first, unsigned int last);
  void Clear() { if (Count() > 0) mVector.Flush(1); }
  void Swap (TextSet& other) { mVector.Swap(other.mVector); }

  // Candidates can be looked up one by one, and need not be built, when none of the texts is beyond the marks. Mark
  // marks text, if it is listed; of equal texts the first. next is where the search begins, and goes on from there:
  // candidates mostly come in order.
  bool CanMark(std::size_t candidates) const { return Count() > 0 && Count() <= kSetLimit && candidates <= kSetLimit; }
  void Mark   (const ZORString& text, Marks& marks, unsigned int& next) const;
  // clang-format on

 private:
  static constexpr unsigned int kFew = 20;  // places of a new value, and the step in which a vector grows by itself

  template <class Test>
  bool KeepThose(Test test);
  void Reserve(unsigned int places);
  static void Require(int had) {
    if (had == 0) Die();
  }
  [[noreturn]] static void Die();

  ZORISVectorImp_String mVector;
};

// Texts mostly arrive in order, so the end is tried first.
template <class Text>
bool TextSet::Insert(Text&& text, Equals equals) {
  const unsigned int count = Count();
  const std::strong_ordering last = count == 0 ? std::strong_ordering::less : Last() <=> text;
  const unsigned int position = last <= 0 ? count : CountLessOrEqual(text);
  const bool listed = last == 0 || (last > 0 && position > 0 && *mVector[position - 1] == text);
  if (listed && equals == Equals::Refused) return false;
  auto* const own = new ZORString(std::forward<Text>(text));
  if (count == mVector.Limit()) Reserve(count + count / 2 + 1);
  Require(mVector.AddAt(own, position));
  return true;
}

}  // namespace zor
