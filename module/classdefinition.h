// Definitions for ZOR_DECLARE_STRING_CLASS, used once per class in the file with its static members.
#pragma once

#include "host/ClassDefinition.h"
#include "module/ZORStringClass.h"

namespace zor {

// The factory in a stream record; the abstract class inherits Build from its base.
template <class Class>
ZORStreamable* BuildRecorded(ZORStreamable* object) {
  return Class::Build(object);
}

}  // namespace zor

// The stream record of the descriptor is registered before that of the class.
#define ZOR_DEFINE_STRING_CLASS(Class, Base, displayName, parent, flag)                                                \
  namespace {                                                                                                          \
  constexpr char k##Class##Ident[] = #Class;                                                                           \
  constexpr char k##Class##DescriptorIdent[] = #Class "_Descriptor";                                                   \
  const ZORStreamableClass k##Class##DescriptorRecord(k##Class##DescriptorIdent, zor::BuildForRead<Class::Descriptor>, \
                                                      1);                                                              \
  const ZORStreamableClass k##Class##Record(k##Class##Ident, zor::BuildRecorded<Class>, 1);                            \
  }                                                                                                                    \
  const char* const Class::sIdent = k##Class##Ident;                                                                   \
  const char* const Class::CastableIdent = k##Class##Ident;                                                            \
  const Class::Descriptor* Class::sDescriptor = nullptr;                                                               \
                                                                                                                       \
  const Class::Descriptor* Class::MakeDescriptor() {                                                                   \
    return sDescriptor = new Descriptor(ZORString(displayName), parent, flag);                                         \
  }                                                                                                                    \
  ZOR_DEFINE_DERIVATION(Class, Base);                                                                                  \
  ZORipstream& Class::readPtr(ZORipstream& in, Class*& object) {                                                       \
    ZORStreamable* const read = in.ReadObjectPointer();                                                                \
    object = DynamicCast(ZORVaDoBase::FromStream(read));                                                               \
    if (object != read) in.SetFail();                                                                                  \
    return in;                                                                                                         \
  }                                                                                                                    \
  ZORipstream& Class::readRef(ZORipstream& in, Class& object) {                                                        \
    ZORStreamable* filled = &object;                                                                                   \
    in.ReadObject(filled);                                                                                             \
    return in;                                                                                                         \
  }                                                                                                                    \
  ZORopstream& Class::writePtr(ZORopstream& out, const Class* object) {                                                \
    out.WriteObjectPointer(object);                                                                                    \
    return out;                                                                                                        \
  }                                                                                                                    \
  ZORopstream& Class::writeRef(ZORopstream& out, const Class& object) {                                                \
    out.WriteObject(&object);                                                                                          \
    return out;                                                                                                        \
  }                                                                                                                    \
  const char* Class::CastableID() const { return CastableIdent; }                                                      \
  const ZORVaDoObjectDescriptor* Class::GetDescriptor() const { return sDescriptor; }                                  \
                                                                                                                       \
  Class::Descriptor::~Descriptor() = default;                                                                          \
  const char* Class::Descriptor::CastableID() const { return k##Class##DescriptorIdent; }                              \
  ZORVaDoObject* Class::Descriptor::CreateObject(void* place, const void* text) const {                                \
    return zor::CreateAt<Class>(place, text);                                                                          \
  }                                                                                                                    \
  ZORVaDoObject* Class::Descriptor::CreateObject(void* place) const { return zor::CreateAt<Class>(place); }            \
  std::size_t Class::Descriptor::GetObjectSize() const { return sizeof(Class); }                                       \
  static_assert(true)
