#include "module/InitModule.h"

#include <cstdio>

#include "module/ZORVaDoString.h"
#include "module/characters.h"
#include "module/readiness.h"
#include "module/valuetypes.h"

int InitModule(ZORVaDoModule* module, ZORVaDoModuleManager* manager) {
  if (module == nullptr || manager == nullptr) return 0;
  ZORVaDoModule* const numbers = manager->OpenModule(ZORString("ZORVadNumbers"));
  if (numbers == nullptr) return 0;
  module->AddLoadedModule(numbers);
  ZORVaDoString::MakeDescriptor();  // the parent of both types; abstract, so not registered
  module->AddObjectDescriptor(zor::MakeSingleDescriptor());
  module->AddObjectDescriptor(zor::MakeEnumDescriptor());
  InitStrings();
  return 1;
}

int TARVOS_WORKSHOP_BDK2_INTERNAL_ZORVadStrings() { return 1; }

void InitStrings() {
  ZORVaDoString::ZorVaDoStringMin = ZORString(ZorVaDoCharMin, 1);
  ZORVaDoString::ZorVaDoStringMax = ZORString(ZorVaDoCharMax, zor::kLengthLimit);
  ZORVaDoString::ZorVaDoStringAny = ZORString(ZorVaDoCharMax, zor::kLengthLimit + 1);
}

#ifndef NDEBUG
void zor::CheckReadiness() {
  static bool told = false;
  if (told || ZORVaDoString::ZorVaDoStringMin.GetLengthInChar() != 0) return;
  told = true;
  std::fputs("ZORVadStrings: a value is made before InitStrings() or InitModule was called\n", stderr);
}
#endif
