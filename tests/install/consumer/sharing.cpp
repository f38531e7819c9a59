// Links the module and opens it by its name too: it is loaded once, and stays when the manager goes.
#include <iostream>

#include "host/ZORPrint.h"
#include "module/InitModule.h"
#include "single/ZORVadSingleString.h"

int main() {
  for (int i = 0; i < 2; ++i) {
    ZORVaDoModuleManager manager;
    const ZORVaDoModule* const module = manager.OpenModule("ZORVadStrings");
    if (module == nullptr) {
      std::cerr << manager.GetFailure() << '\n';
      return 1;
    }
    if (module->FindDescriptor("single string") != ZORVadSingleString::sDescriptor) return 2;
  }
  ZORVadSingleString text(ZORString("a")), longer;
  return longer.CalcConcatenation(text, text) == 1 ? 0 : 3;
}
