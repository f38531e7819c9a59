// Definitions that classes of the host and of modules have in common.
#pragma once

#include <new>
#include <type_traits>

#include "host/ZORSolver.h"

namespace zor {

// Stream factory: returns object, or for null a new object for Read to fill.
template <class Class>
ZORStreamable* BuildForRead(ZORStreamable* object) {
  return object != nullptr ? object : new Class(ZorStreamableInit);
}

// Constructs a value in the caller's memory; null for a null place and for an abstract class.
template <class Class, class... From>
ZORVaDoObject* CreateAt(void* place, From... from) {
  if constexpr (std::is_abstract_v<Class>) {
    return nullptr;
  } else {
    return place != nullptr ? new (place) Class(from...) : nullptr;
  }
}

}  // namespace zor

// Types are identified by the address of sIdent, their own or that of a base.
#define ZOR_DEFINE_DERIVATION(Class, Base)                                                                    \
  int Class::IsDerivedFrom(const char* ident) const { return ident == sIdent || Base::IsDerivedFrom(ident); } \
  static_assert(true)
