// The guarded entry of an operation: the solver passes values of any class, and null references where an operand is
// missing; an entry tests its arguments, first to last, and goes on to the typed body.
#pragma once

#include "host/ZORSolver.h"

namespace zor {

// Whether the reference refers to anything. The one test of its kind: the compilers keep it only because the module
// is built with -fno-delete-null-pointer-checks.
inline bool IsPresent(const ZORVaDoBase& value) {
  const ZORVaDoBase* const address = &value;
  return address != nullptr;
}

// The state of an operand of any class; a missing one has none.
inline bool IsNil(const ZORVaDoAny& value) { return IsPresent(value) && value.IsNil() != 0; }
inline bool IsUndefined(const ZORVaDoAny& value) { return IsPresent(value) && value.IsUndefined() != 0; }

// Answers what body answers on value as a Class, what otherwise answers when value is missing or of another class.
template <class Class, class Arg, class Body, class Otherwise>
auto GuardedElse(Arg& value, Body body, Otherwise otherwise) {
  auto* const typed = Class::DynamicCast(&value);
  return typed != nullptr ? body(*typed) : otherwise();
}

// The same with the answer 0, nothing changed, for an argument that does not fit.
template <class Class, class Arg, class Body>
int Guarded(Arg& value, Body body) {
  return GuardedElse<Class>(value, body, [] { return 0; });
}

template <class Class, class X, class Y, class Body>
int Guarded(X& x, Y& y, Body body) {
  return Guarded<Class>(
      x, [&](auto& typedX) { return Guarded<Class>(y, [&](auto& typedY) { return body(typedX, typedY); }); });
}

}  // namespace zor
