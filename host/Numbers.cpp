// Identity, casts, descriptors and stream records of the number types.
#include "host/ZORNumbers.h"

#include "host/Descriptors.h"

#define ZOR_DEFINE_TYPE_TEST(Class, Base)   \
  const char* const Class::sIdent = #Class; \
  ZOR_DEFINE_DERIVATION(Class, Base)

#define ZOR_DEFINE_NUMBER_CLASS(Class, Base, displayName, parent)                                                      \
  ZOR_DEFINE_TYPE_TEST(Class, Base);                                                                                   \
  namespace {                                                                                                          \
  constexpr char k##Class##DescriptorIdent[] = #Class "_Descriptor";                                                   \
  using Class##Descriptor = zorhost::HostDescriptor<Class, k##Class##DescriptorIdent>;                                 \
  const Class##Descriptor k##Class(ZORString(displayName), parent, 0);                                                 \
  const ZORStreamableClass k##Class##DescriptorRecord(k##Class##DescriptorIdent, zor::BuildForRead<Class##Descriptor>, \
                                                      ZORStreamableClass::kSolverClass);                               \
  const ZORStreamableClass k##Class##Record(#Class, zor::BuildForRead<Class>, ZORStreamableClass::kSolverClass);       \
  }                                                                                                                    \
  const ZORVaDoObjectDescriptor* const Class::sDescriptor = &k##Class;                                                 \
  const char* Class::CastableID() const { return sIdent; }                                                             \
  const ZORVaDoObjectDescriptor* Class::GetDescriptor() const { return sDescriptor; }                                  \
  static_assert(true)

ZOR_DEFINE_TYPE_TEST(ZORVaDoBoolean, ZORVaDoAny);
ZOR_DEFINE_TYPE_TEST(ZORVaDoInteger, ZORVaDoScalar);
ZOR_DEFINE_NUMBER_CLASS(ZORVadSingleBoolean, ZORVaDoBoolean, "single boolean", nullptr);
ZOR_DEFINE_NUMBER_CLASS(ZORVadSingleInteger, ZORVaDoInteger, "single integer", ZORVaDoScalar::sDescriptor);
ZOR_DEFINE_NUMBER_CLASS(ZORVadIntervalInteger, ZORVaDoInteger, "interval integer", ZORVaDoScalar::sDescriptor);
ZOR_DEFINE_NUMBER_CLASS(ZORVadEnumInteger, ZORVaDoInteger, "enum integer", ZORVaDoScalar::sDescriptor);

void zorhost::AddNumberDescriptors(ZORVaDoModule& module) {
  module.AddObjectDescriptor(ZORVadSingleBoolean::sDescriptor);
  module.AddObjectDescriptor(ZORVadSingleInteger::sDescriptor);
  module.AddObjectDescriptor(ZORVadIntervalInteger::sDescriptor);
  module.AddObjectDescriptor(ZORVadEnumInteger::sDescriptor);
}
