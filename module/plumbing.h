// The definitions behind ZOR_DECLARE_STRING_CLASS, one row a class, in the source file that holds its statics.
#pragma once

#include <type_traits>

#include "module/ZORStringClass.h"

namespace zor {

// A value built in the caller's memory from what an Undefined or a known value is made of; null for a null place
// and for a class that cannot be made.
template <class Class, class... From>
ZORVaDoObject* CreateAt(void* place, From... from) {
  if constexpr (std::is_abstract_v<Class>) {
    return nullptr;
  } else {
    return place != nullptr ? new (place) Class(from...) : nullptr;
  }
}

// The factory scheme of the stream layer: an object given is answered, for a null one a new one is made for Read.
template <class Class>
ZORStreamable* BuildForRead(ZORStreamable* object) {
  return object != nullptr ? object : new Class(ZorStreamableInit);
}

// The factory that a record names; the abstract class leans on that of its base.
template <class Class>
ZORStreamable* BuildRecorded(ZORStreamable* object) {
  return Class::Build(object);
}

}  // namespace zor

// The record of the descriptor is built before that of the class; both keep the texts given here.
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
  Class* Class::DynamicCast(ZORVaDoBase* object) { return IsKindOf(object, sIdent) ? StaticCast(object) : nullptr; }   \
  const Class* Class::DynamicCast(const ZORVaDoBase* object) {                                                         \
    return IsKindOf(object, sIdent) ? StaticCast(object) : nullptr;                                                    \
  }                                                                                                                    \
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
  int Class::IsDerivedFrom(const char* ident) const { return ident == sIdent ? 1 : Base::IsDerivedFrom(ident); }       \
                                                                                                                       \
  Class::Descriptor::~Descriptor() = default;                                                                          \
  const char* Class::Descriptor::CastableID() const { return k##Class##DescriptorIdent; }                              \
  ZORVaDoObject* Class::Descriptor::CreateObject(void* place, const void* text) const {                                \
    return zor::CreateAt<Class>(place, text);                                                                          \
  }                                                                                                                    \
  ZORVaDoObject* Class::Descriptor::CreateObject(void* place) const { return zor::CreateAt<Class>(place); }            \
  std::size_t Class::Descriptor::GetObjectSize() const { return sizeof(Class); }                                       \
  static_assert(true)
