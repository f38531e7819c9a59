// Descriptors of the host's types.
#pragma once

#include <cstddef>

#include "host/ClassDefinition.h"

namespace zorhost {

// Makes values of one class; ident is its name in streams. A value with content is read from its text form. Descriptors
// of the host are static objects and owned by no module.
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

// Registers the number types with module.
void AddNumberDescriptors(ZORVaDoModule& module);

}  // namespace zorhost
