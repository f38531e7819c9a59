// Entries of the virtual table of sets.
#pragma once

#include <type_traits>

#include "enum/ZORVadEnumString.h"
#include "host/Guard.h"

namespace zor {

// Checks common to the entries: a Nil target stays Nil, a Nil source makes it Nil, an Undefined source changes nothing.
template <class Target, class Body, class... Sources>
int NarrowedFrom(Target& target, Body body, const Sources&... sources) {
  if (target.IsNil()) return 0;
  if ((sources.IsNil() || ...)) return target.Nil();
  if ((sources.IsUndefined() || ...)) return 0;
  return body();
}

// Guarded, then those checks, then body. A non-const self is the target and its operands are the sources; otherwise the
// non-const operand is the target and self the source.
template <class... Classes, class Self, class X, class Body>
int Narrowed(Self& self, X& x, Body body) {
  return Guarded<Classes...>(x, [&](auto& a) {
    const auto typed = [&] { return body(a); };
    if constexpr (std::is_const_v<Self>) {
      return NarrowedFrom(a, typed, self);
    } else {
      return NarrowedFrom(self, typed, a);
    }
  });
}

template <class... Classes, class Self, class X, class Y, class Body>
int Narrowed(Self& self, X& x, Y& y, Body body) {
  return Guarded<Classes...>(x, y, [&](auto& a, auto& b) {
    const auto typed = [&] { return body(a, b); };
    if constexpr (!std::is_const_v<Self>) {
      return NarrowedFrom(self, typed, a, b);
    } else if constexpr (!std::is_const_v<X>) {
      return NarrowedFrom(a, typed, self);
    } else {
      return NarrowedFrom(b, typed, self);
    }
  });
}

}  // namespace zor
