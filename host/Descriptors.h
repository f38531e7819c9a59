// The descriptors of the host's own types.
#pragma once

#include <cstddef>

#include "host/ClassDefinition.h"

namespace zorhost {

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

  ZORVaDoObject* CreateObject(void* place) const override { return zor::CreateAt<Value>(place); }
  std::size_t GetObjectSize() const override { return sizeof(Value); }
};

// Hands module the types of numbers.
void AddNumberDescriptors(ZORVaDoModule& module);

}  // namespace zorhost
