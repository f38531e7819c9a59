// A module that brings one type and tells of the end of its descriptors.
#include "host/ZORSolver.h"

#ifndef PROBE_ANSWER
#define PROBE_ANSWER 1
#endif

namespace {

const ZORStreamableClass kRecord(PROBE_NAME, ZORVaDoBase::Build, 1);

class Descriptor : public ZORVaDoObjectDescriptor {
 public:
  using ZORVaDoObjectDescriptor::ZORVaDoObjectDescriptor;
  // The coming and going of a record is what a test can watch from outside.
  ~Descriptor() override { ZORStreamableClass(GetName().CastToCharPtr(), ZORVaDoBase::Build, 0); }
  const char* CastableID() const override { return PROBE_NAME; }
  ZORVaDoObject* CreateObject(void*, const void*) const override { return nullptr; }
  ZORVaDoObject* CreateObject(void*) const override { return nullptr; }
  std::size_t GetObjectSize() const override { return 0; }
};

const Descriptor kStaticDescriptor("of the library itself", nullptr, 0);

}  // namespace

#ifndef PROBE_WITHOUT_ENTRY
extern "C" ZOR_EXPORT int InitModule(ZORVaDoModule* module, ZORVaDoModuleManager* manager) {
#ifdef PROBE_NEEDS
  module->AddLoadedModule(manager->OpenModule(PROBE_NEEDS));
#endif
  new Descriptor("not registered", nullptr, 0);
  manager->OpenModule("ZORVadNumbers");
  module->AddObjectDescriptor(new Descriptor("registered", nullptr, 0));
  return PROBE_ANSWER;
}
#endif
