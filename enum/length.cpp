// Lengths of sets of texts, in characters.
#include <utility>

#include "enum/ZORVadEnumString.h"

int ZORVadEnumString::CalcLength(ZORVaDoInteger& n) const {
  if (IsNil()) return n.SetNilValue(), 1;
  if (IsUndefined()) return n.SetUndefinedValue(), 1;
  ZORVadEnumInteger lengths;
  lengths.SetNilValue();
  for (const ZORString* const text : mTexts.All()) lengths.Insert(text->GetLengthInChar());
  if (auto* const single = ZORVadSingleInteger::DynamicCast(&n)) return lengths.IntersectInverse(*single);
  if (auto* const interval = ZORVadIntervalInteger::DynamicCast(&n)) return lengths.IntersectInverse(*interval);
  if (auto* const set = ZORVadEnumInteger::DynamicCast(&n)) return set->Intersect(lengths);
  return 0;
}

// Returns 1 even if it drops no text. The state Max becomes Exact.
int ZORVadEnumString::CalcInverseLength(const ZORVaDoInteger& n) {
  if (n.IsNil()) return Nil();
  if (n.IsUndefined() || IsNil() || IsUndefined()) return 0;
  if (n.GetExactValue() < 0) return Nil();
  Texts kept(mTexts.Count());
  ZORVadSingleInteger length;
  for (const ZORString* const text : mTexts.All()) {
    length.SetExactValue(text->GetLengthInChar());
    if (!n.IsIntersected(length)) continue;
    if (kept.Count() == zor::kSetLimit) return Become(ZorStringAny);
    kept.Insert(*text);
  }
  return Become(kept.Count() > 0 ? ZorStringExact : ZorStringNil, std::move(kept));
}
