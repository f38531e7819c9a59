// Definitions that the solver's classes have alike, in the host and in its modules.
#pragma once

#include <new>
#include <type_traits>

#include "host/ZORSolver.h"

namespace zor {

// The factory scheme of the stream layer: an object given is answered, for a null one a new one is made for Read.
template <class Class>
ZORStreamable* BuildForRead(ZORStreamable* object) {
  return object != nullptr ? object : new Class(ZorStreamableInit);
}

// A value in the caller's memory; null for a null place and for a class that cannot be made.
template <class Class, class... From>
ZORVaDoObject* CreateAt(void* place, From... from) {
  if constexpr (std::is_abstract_v<Class>) {
    return nullptr;
  } else {
    return place != nullptr ? new (place) Class(from...) : nullptr;
  }
}

}  // namespace zor

// A type is told by the address of its sIdent, or by that of a type it derives from.
#define ZOR_DEFINE_DERIVATION(Class, Base)                                                                    \
  int Class::IsDerivedFrom(const char* ident) const { return ident == sIdent || Base::IsDerivedFrom(ident); } \
  static_assert(true)

#define ZOR_DEFINE_CASTS(Class, Base)                                              \
  Class* Class::DynamicCast(ZORVaDoBase* object) {                                 \
    return IsKindOf(object, sIdent) ? static_cast<Class*>(object) : nullptr;       \
  }                                                                                \
  const Class* Class::DynamicCast(const ZORVaDoBase* object) {                     \
    return IsKindOf(object, sIdent) ? static_cast<const Class*>(object) : nullptr; \
  }                                                                                \
  ZOR_DEFINE_DERIVATION(Class, Base)
