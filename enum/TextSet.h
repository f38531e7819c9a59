// The ordered texts of a ZORVadEnumString. A member of an exported class, but not exported itself.
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

// Texts in ascending order at positions from 0; the set owns them all. Inserting copies a text, or moves an rvalue.
// Equal texts, if they were accepted, are adjacent. An empty set has no array; capacity grows by half, so that building
// a large set in order is linear. Running out of memory ends the process: a lost text would be a wrong answer.
class TextSet {
 public:
  enum class Equals { Refused, Accepted };  // whether a text that is present is inserted again
  using Marks = std::bitset<kSetLimit>;     // of positions

  TextSet() = default;
  explicit TextSet(std::size_t expected) { Reserve(static_cast<unsigned int>(std::min(expected, kSetLimit))); }
  ~TextSet() { DeleteAll(); }
  TextSet(const TextSet&) = delete;
  TextSet& operator=(const TextSet&) = delete;

  // clang-format off
  unsigned int Count     () const { return mVector.Count(); }
  ZORString&   operator[](unsigned int position) const { return *mVector[position]; }
  ZORString&   First     () const { return *mVector[0]; }
  ZORString&   Last      () const { return *mVector[Count() - 1]; }

  // The texts as a vector, and as a range of pointers.
  const ZORISVectorImp_String& Vector() const { return mVector; }
  std::span<const ZORString* const> All() const { return {PlacesOf(mVector), Count()}; }

  // Positions as the vector returns them, greater than Count() when there is none. The counts are of texts less than
  // bound, and less than or equal to it.
  unsigned int Find            (const ZORString* text)  const { return mVector.Find(text); }
  unsigned int FindLowerBound  (const ZORString& text)  const { return mVector.FindLowerBound(&text, 0); }
  unsigned int FindUpperBound  (const ZORString& text)  const { return mVector.FindUpperBound(&text, 0); }
  unsigned int CountLess       (const ZORString& bound) const { return CountLess(All(), bound); }
  unsigned int CountLessOrEqual(const ZORString& bound) const;
  unsigned int CountLess       (const ZORString& bound, unsigned int near) const;  // the same, fast if it is near

  // Insert returns whether text was inserted; it comes after its equals. Merge inserts ascending texts and returns
  // whether all were inserted.
  template <class Text>
  bool Insert(Text&& text, Equals equals = Equals::Refused);
  bool Merge (const ZORISVectorImp_String& texts, Equals equals);

  // Keep drops the texts that are not in others, which ascend, or that are not marked, and returns whether it dropped
  // any. Cut drops the positions [first, last).
  bool Keep (const ZORISVectorImp_String& others);
  bool Keep (const Marks& marks);
  void Cut  (unsigned int first, unsigned int last) { if (first < last) mVector.DetachAt(first, last - first, 1); }
  void Clear() { DeleteAll(), mVector.Flush(0, Count(), 0); }
  void Swap (TextSet& other) { mVector.Swap(other.mVector); }

  // Narrowing without building the candidates: Mark each, then Keep the marked texts. CanMark: neither side is too
  // large for that. Mark marks text if it is present, the first of its equals; near is where to look first, and then
  // where the next candidate may be.
  bool CanMark(std::size_t candidates) const { return Count() > 0 && Count() <= kSetLimit && candidates <= kSetLimit; }
  void Mark   (const ZORString& text, Marks& marks, unsigned int& near) const;
  // clang-format on

 private:
  static constexpr unsigned int kFirst = 4, kMore = 20;  // the first capacity; it grows by a multiple of the other

  static ZORString** PlacesOf(const ZORISVectorImp_String& texts) { return texts.Limit() == 0 ? nullptr : &texts[0]; }
  static unsigned int CountLess(std::span<const ZORString* const> texts, const ZORString& bound);
  void DeleteAll();
  template <class Test>
  bool KeepThose(Test test);
  void Reserve(unsigned int places);
  static void Require(int had) {
    if (had == 0) Die();
  }
  [[noreturn]] static void Die();

  ZORISVectorImp_String mVector;
};

inline unsigned int TextSet::CountLess(std::span<const ZORString* const> texts, const ZORString& bound) {
  const auto less = [](const ZORString* listed, const ZORString& limit) { return *listed < limit; };
  const ZORString* const* const first = texts.data();
  return static_cast<unsigned int>(std::lower_bound(first, first + texts.size(), bound, less) - first);
}

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
