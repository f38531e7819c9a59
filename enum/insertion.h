// How texts get into a set, in one bisection; a text that is given away is moved, not copied.
#pragma once

#include <utility>

#include "enum/ZORVadEnumString.h"

// What Insert does. The answers of Contains come from the place that a new text would take.
template <class Text>
int ZORVadEnumString::Place(Text&& text) {
  const unsigned int count = mVector.Count();
  const std::strong_ordering last = count == 0 ? std::strong_ordering::less : Last() <=> text;
  const unsigned int position = last <= 0 ? count : CountUpTo(text);  // texts mostly arrive in order
  const bool listed = last == 0 || (last > 0 && position > 0 && *mVector[position - 1] == text);
  if (listed && !IsUndefined() && !IsNil()) return 0;
  Store(new ZORString(std::forward<Text>(text)), position);
  return 1;
}

// What InsertExactValue does. The limit comes before the test for a listed text; larger sets take further texts.
template <class Text>
void ZORVadEnumString::PlaceExact(Text&& text) {
  if (IsUndefined() || IsFull()) return;
  if (mVector.Count() == zor::kSetLimit) return SetUndefinedValue();
  Place(std::forward<Text>(text));
  mState = ZorStringExact;
}
