#include "module/InitModule.h"

#include "module/ZORVaDoString.h"
#include "module/characters.h"
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
