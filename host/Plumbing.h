// What the host's own value types have alike. Not for modules.
#pragma once

#include <cstddef>
#include <type_traits>

#include "host/ZORSolver.h"

namespace zorhost {

// Factory of a class that can be made for Read.
template <class Class>
ZORStreamable* BuildForRead(ZORStreamable* object) {
  return object != nullptr ? object : new Class(ZorStreamableInit);
}

// The maker of Value, known to the streams as ident. A known value is read from its text form. The descriptors of
// the host are static objects, which no module owns.
template <class Value, const char* ident>
class HostDescriptor final : public ZORVaDoObjectDescriptor {
 public:
  using ZORVaDoObjectDescriptor::ZORVaDoObjectDescriptor;

  const char* CastableID() const override { return ident; }

  ZORVaDoObject* CreateObject(void* place, const void* text) const override {
    ZORVaDoObject* object = CreateObject(place);
    ZORistrstream in(static_cast<const char*>(text), 0);
    if (object != nullptr) object->InputValue(in);
    return object;
  }

  ZORVaDoObject* CreateObject(void* place) const override {
    if constexpr (std::is_abstract_v<Value>) {
      return nullptr;
    } else {
      return place != nullptr ? new (place) Value : nullptr;
    }
  }

  std::size_t GetObjectSize() const override { return sizeof(Value); }
};

// Answers what body answers on value as a Class; 0 when value is null or of another class.
template <class Class, class Arg, class Body>
int Guarded(Arg& value, Body body) {
  auto* object = Class::DynamicCast(&value);
  return object != nullptr ? body(*object) : 0;
}

template <class Class, class X, class Y, class Body>
int Guarded(X& x, Y& y, Body body) {  // x is tested before y
  return Guarded<Class>(x, [&](auto& a) { return Guarded<Class>(y, [&](auto& b) { return body(a, b); }); });
}

// Hands module the types of numbers.
void AddNumberDescriptors(ZORVaDoModule& module);

}  // namespace zorhost
