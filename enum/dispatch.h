// The ways from an entry of the table to a typed form on sets, each written once for all the operations that take it.
#pragma once

#include "enum/ZORVadEnumString.h"
#include "module/guard.h"

namespace zor {

// Answers what body answers on value as a set or as a single string, what otherwise answers on any other.
template <class Arg, class Body, class Otherwise>
auto GuardedStringElse(Arg& value, Body body, Otherwise otherwise) {
  return GuardedElse<ZORVadEnumString>(value, body,
                                       [&] { return GuardedElse<ZORVadSingleString>(value, body, otherwise); });
}

template <class Arg, class Body>
int GuardedString(Arg& value, Body body) {
  return GuardedStringElse(value, body, [] { return 0; });
}

// target is narrowed by sources: nothing becomes of a Nil target, a Nil source makes it Nil, and body runs when every
// source is known.
template <class Body, class... Sources>
int Narrowed(ZORVaDoString& target, Body body, const Sources&... sources) {
  if (target.IsNil()) return 0;
  if ((sources.IsNil() || ...)) return target.Nil();
  if ((sources.IsUndefined() || ...)) return 0;
  return body();
}

}  // namespace zor
