// Set operations of sets of texts: intersection, equality and union.
#include <algorithm>

#include "enum/entries.h"

namespace {

constexpr unsigned int kAhead = 8;    // places between a text that is compared and one on its way into the cache
constexpr unsigned int kSearch = 16;  // so many times larger a set is searched, not walked

// Asks for the text that stands kAhead places behind position i.
void FetchAhead(ZORString* const* places, unsigned int i, unsigned int count) {
  if (i + kAhead < count) __builtin_prefetch(places[i + kAhead]);
}

}  // namespace

int ZORVadEnumString::Intersect(const ZORVadEnumString& other) {
  if (IsNil()) return 0;
  if (other.IsNil()) return Nil();
  if (other.IsUndefined()) return 0;
  if (IsFull() && other.mState == ZorStringMax) return 0;
  if (IsFull()) return Nil();
  if (IsUndefined()) return Copy(other), 1;
  return Keep(other.mVector);
}

int ZORVadEnumString::Intersect(const ZORISVectorImp_String& texts) {
  if (IsNil()) return 0;
  if (!IsUndefined()) return Keep(texts);
  Append(texts);
  mState = Count() > 0 ? ZorStringExact : ZorStringNil;
  return 1;
}

// Keeps the texts that stand in both, in one walk over both. Nothing is built: a text that is lost is deleted on the
// spot, and those behind it move up. The state stays unless nothing does.
int ZORVadEnumString::Keep(const ZORISVectorImp_String& texts) {
  const unsigned int count = mVector.Count(), others = texts.Count();
  ZORString** const places = &mVector[0];
  const bool searches = others / kSearch > count;
  unsigned int kept = 0;
  for (unsigned int i = 0, j = 0; i < count; ++i) {
    FetchAhead(places, i, count);
    if (searches) j = std::max(j, CountBelow(texts, *places[i]));
    std::strong_ordering order = std::strong_ordering::less;
    while (j < others && (order = *places[i] <=> *texts[j]) > 0) FetchAhead(&texts[0], ++j, others);
    if (j < others && order == 0) {
      places[kept++] = places[i];
      ++j;
    } else {
      delete places[i];
    }
  }
  if (kept == count) return 0;
  mVector.SetTop(kept, count);
  return kept > 0 ? 1 : Nil();
}

// What Insert of each text would do, for texts in order, in one merge: our places move to the end of an array with
// room for all, and both runs are read from there into its front, which never overtakes them.
int ZORVadEnumString::Merge(const ZORISVectorImp_String& texts) {
  const unsigned int own = mVector.Count(), more = texts.Count();
  const bool known = !IsUndefined() && !IsNil();
  Reserve(own + more);
  ZORString** const places = &mVector[0];
  ZORString** next = places + more;
  ZORString** const end = next + own;
  std::copy_backward(places, places + own, end);

  ZORString** out = places;
  const ZORString* added = nullptr;
  for (unsigned int i = 0; i < more; ++i) {
    FetchAhead(&texts[0], i, more);
    const ZORString& text = *texts[i];
    std::strong_ordering order = std::strong_ordering::greater;
    while (next != end && ((order = **next <=> text) < 0 || (order == 0 && !known))) *out++ = *next++;
    const bool listed = (next != end && order == 0) || (added != nullptr && *added == text);
    if (listed && known) continue;
    added = *out++ = new ZORString(text);
  }
  while (next != end) *out++ = *next++;
  const auto count = static_cast<unsigned int>(out - places);
  mVector.SetTop(count, own + more);
  return count == own + more ? 1 : 0;
}

// The end of the operations that build candidates: candidates are used up.
int ZORVadEnumString::Narrow(ZORVadEnumString& candidates) {
  return IsUndefined() && !candidates.IsUndefined() ? Take(candidates) : Intersect(candidates);
}

// Candidates for a set with texts can be looked up there one by one and need not be built, as long as there are too
// few of them to make a value Undefined.
bool ZORVadEnumString::CanMark(std::size_t candidates) const {
  return !IsUndefined() && mVector.Count() > 0 && mVector.Count() <= zor::kSetLimit && candidates <= zor::kSetLimit;
}

// Candidates mostly come in order, so the place behind the last one found is tried first. Of equal texts the first
// alone is meant.
void ZORVadEnumString::Mark(const ZORString& candidate, Marks& marks, unsigned int& next) const {
  if (next > 0 && next <= mVector.Count() && *mVector[next - 1] == candidate) return;
  if (next >= mVector.Count() || *mVector[next] != candidate) next = mVector.ClusteredFind(&candidate);
  if (next < mVector.Count()) marks.set(next++);
}

int ZORVadEnumString::KeepMarked(const Marks& marks) {
  const unsigned int count = mVector.Count();
  if (marks.count() == count) return 0;
  ZORString** const places = &mVector[0];
  unsigned int kept = 0;
  for (unsigned int i = 0; i < count; ++i) {
    if (marks[i]) {
      places[kept++] = places[i];
    } else {
      delete places[i];
    }
  }
  mVector.SetTop(kept, count);
  return kept > 0 ? 1 : Nil();
}

// Both tests of the single value's extremes stand before every look at the target's content.
int ZORVadEnumString::Intersect(const ZORVadSingleString& other) {
  if (IsNil()) return 0;
  if (other.IsNil()) return Nil();
  if (other.IsUndefined()) return 0;
  if (other.IsFull()) return 0;
  if (IsFull()) return Nil();
  if (IsUndefined()) return Copy(other);
  if (Contains(other.GetLowerBound()) == 0) return Nil();
  return Copy(other);
}

int ZORVadEnumString::IntersectInverse(ZORVadSingleString& target) const {
  if (target.IsNil()) return 0;
  if (IsUndefined()) return 0;
  if (IsNil()) return target.Nil();
  if (target.IsUndefined() && Count() == 1) return target.Copy(First());
  if (target.IsUndefined()) return 0;
  if (Contains(target.GetLowerBound()) != 0) return 0;
  return target.Nil();
}

int ZORVadEnumString::CalcEqualValue(const ZORVadEnumString& other) { return Intersect(other); }
int ZORVadEnumString::CalcEqualValue(const ZORVadSingleString& other) { return Intersect(other); }
int ZORVadEnumString::CalcInverseEqualValue(ZORVadEnumString& target) const { return target.Intersect(*this); }
int ZORVadEnumString::CalcInverseEqualValue(ZORVadSingleString& target) const { return IntersectInverse(target); }

void ZORVadEnumString::Unite(const ZORVadEnumString& other) {
  if (IsUndefined()) return;
  if (other.IsUndefined()) return SetUndefinedValue();
  if (other.IsNil()) return;
  if (IsNil()) {
    Copy(other);
  } else {
    Append(other);
  }
}

void ZORVadEnumString::Unite(const ZORVadSingleString& other) {
  if (IsUndefined()) return;
  if (other.IsUndefined()) return SetUndefinedValue();
  if (other.IsNil()) return;
  if (IsNil()) {
    Copy(other);
  } else {
    Insert(other.GetLowerBound());
  }
}

int ZORVadEnumString::IsIntersected(const ZORVaDoAny& other) const {
  if (IsNil() || zor::IsNil(other)) return 0;
  if (IsUndefined() || zor::IsUndefined(other)) return 1;
  if (const auto* const single = Single::DynamicCast(&other)) {
    if (IsFull()) return single->IsFull();
    return Contains(single->GetLowerBound()) != 0;
  }
  if (const auto* const set = Enum::DynamicCast(&other)) {
    if (IsFull()) return set->mState == ZorStringMax;
    for (ZORISVectorIteratorImp_String text(set->mVector); text; ++text) {
      if (Contains(text.Current()) != 0) return 1;
    }
  }
  return 0;
}

void ZORVadEnumString::Intersect(const ZORVaDoAny& other) {
  zor::GuardedOrNil<Enum, Single>(*this, other, [&](auto& string) { return Intersect(string); });
}

void ZORVadEnumString::Unite(const ZORVaDoAny& other) {
  zor::GuardedOrNil<Enum, Single>(*this, other, [&](auto& string) { return Unite(string), 0; });
}

int ZORVadEnumString::CalcEqualValue(const ZORVaDoAny& other) {
  return zor::Guarded<Enum, Single>(other, [&](auto& string) { return CalcEqualValue(string); });
}

int ZORVadEnumString::CalcInverseEqualValue(ZORVaDoAny& target) const {
  return zor::Guarded<Enum, Single>(target, [&](auto& string) { return CalcInverseEqualValue(string); });
}

void ZORVadEnumString::Bisect(ZORVaDoObject& other, ValueSelection selection) {
  const auto leaveWhole = [&](auto&) { return selection >= 0 && selection <= 3 ? 0 : Nil(); };
  zor::GuardedOrNil<Enum>(*this, other, leaveWhole);
}
