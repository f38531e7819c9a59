// Argument checks of virtual operations. The solver passes operands of any class, and null references for missing ones;
// an entry checks its operands in order and calls the typed body.
#pragma once

#include "host/ZORSolver.h"

namespace zor {

// Whether the reference is not null. Compilers keep this test only with -fno-delete-null-pointer-checks.
inline bool IsPresent(const ZORVaDoBase& value) {
  const ZORVaDoBase* const address = &value;
  return address != nullptr;
}

// The state of an operand of any class; false for a missing one.
inline bool IsNil(const ZORVaDoAny& value) { return IsPresent(value) && value.IsNil() != 0; }
inline bool IsUndefined(const ZORVaDoAny& value) { return IsPresent(value) && value.IsUndefined() != 0; }

// Calls body on value as the first of the classes it belongs to, or otherwise when it is missing or belongs to none.
template <class Class, class... More, class Arg, class Otherwise, class Body>
int GuardedElse(Arg& value, Otherwise otherwise, Body body) {
  if (auto* const typed = Class::DynamicCast(&value)) return body(*typed);
  if constexpr (sizeof...(More) > 0) {
    return GuardedElse<More...>(value, otherwise, body);
  } else {
    return otherwise();
  }
}

// The same; a missing or wrong operand makes target Nil.
template <class... Classes, class Target, class Arg, class Body>
int GuardedOrNil(Target& target, Arg& value, Body body) {
  const auto nil = [&] { return target.Nil(); };
  return GuardedElse<Classes...>(value, nil, body);
}

// The same; a missing or wrong operand changes nothing, 0.
template <class... Classes, class X, class Body>
int Guarded(X& x, Body body) {
  const auto unchanged = [] { return 0; };
  return GuardedElse<Classes...>(x, unchanged, body);
}

template <class... Classes, class X, class Y, class Body>
int Guarded(X& x, Y& y, Body body) {  // checks x first
  return Guarded<Classes...>(x, [&](auto& a) { return Guarded<Classes...>(y, [&](auto& b) { return body(a, b); }); });
}

}  // namespace zor
