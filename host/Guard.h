// The guarded entry of an operation. The solver passes values of any class, and null references where an operand is
// missing; an entry tests its operands, first to last, and goes on to the typed body.
#pragma once

#include "host/ZORSolver.h"

namespace zor {

// Whether the reference refers to anything. The compilers keep this test only under -fno-delete-null-pointer-checks.
inline bool IsPresent(const ZORVaDoBase& value) {
  const ZORVaDoBase* const address = &value;
  return address != nullptr;
}

// The state of an operand of any class; a missing one has none.
inline bool IsNil(const ZORVaDoAny& value) { return IsPresent(value) && value.IsNil() != 0; }
inline bool IsUndefined(const ZORVaDoAny& value) { return IsPresent(value) && value.IsUndefined() != 0; }

// Answers what body answers on value as the first of the classes that it is of, and what otherwise answers when value
// is missing or of none of them.
template <class Class, class... More, class Arg, class Otherwise, class Body>
int GuardedElse(Arg& value, Otherwise otherwise, Body body) {
  if (auto* const typed = Class::DynamicCast(&value)) return body(*typed);
  if constexpr (sizeof...(More) > 0) {
    return GuardedElse<More...>(value, otherwise, body);
  } else {
    return otherwise();
  }
}

// The same where an operand that does not fit makes target Nil.
template <class... Classes, class Target, class Arg, class Body>
int GuardedOrNil(Target& target, Arg& value, Body body) {
  const auto nil = [&] { return target.Nil(); };
  return GuardedElse<Classes...>(value, nil, body);
}

// The same where it changes nothing, 0.
template <class... Classes, class X, class Body>
int Guarded(X& x, Body body) {
  const auto unchanged = [] { return 0; };
  return GuardedElse<Classes...>(x, unchanged, body);
}

template <class... Classes, class X, class Y, class Body>
int Guarded(X& x, Y& y, Body body) {  // x is tested before y
  return Guarded<Classes...>(x, [&](auto& a) { return Guarded<Classes...>(y, [&](auto& b) { return body(a, b); }); });
}

}  // namespace zor
