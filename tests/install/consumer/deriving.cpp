// Derives from classes of the libraries, with type information or without it.
#include <iostream>
#include <typeinfo>

#include "enum/ZORVadEnumString.h"
#include "module/InitModule.h"

// Counts what is opened.
class CountingManager : public ZORVaDoModuleManager {
 public:
  ZORVaDoModule* OpenModule(const ZORString& name) override {
    ++opened;
    return ZORVaDoModuleManager::OpenModule(name);
  }

  int opened = 0;
};

// A set that knows how often it was narrowed.
class CountingSet : public ZORVadEnumString {
 public:
  using ZORVadEnumString::ZORVadEnumString;
  void Intersect(const ZORVaDoAny& other) override {
    ZORVadEnumString::Intersect(other);
    ++narrowed;
  }

  int narrowed = 0;
};

int main() {
  CountingManager manager;
  ZORVaDoModuleManager& asManager = manager;
  if (asManager.OpenModule("ZORVadStrings") == nullptr || manager.opened != 2) return 1;  // the module opens another

  CountingSet set("a");
  set.InsertExactValue("b");
  ZORVaDoAny& asAny = set;
  asAny.Intersect(ZORVadEnumString("b"));
  if (set.narrowed != 1 || set.Count() != 1) return 2;
#ifdef __GXX_RTTI
  if (dynamic_cast<ZORVaDoString*>(&asAny) != &set || typeid(asAny) != typeid(CountingSet)) return 3;
#endif
}
