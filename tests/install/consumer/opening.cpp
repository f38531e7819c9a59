// Opens the module by its file and is linked with nothing of it: opening FILE.
#include <dlfcn.h>

#include <iostream>

int main(int, char** arguments) {
  void* const module = dlopen(arguments[1], RTLD_NOW | RTLD_LOCAL);
  if (module == nullptr) {
    std::cerr << dlerror() << '\n';
    return 1;
  }
  const auto mark = reinterpret_cast<int (*)()>(dlsym(module, "TARVOS_WORKSHOP_BDK2_INTERNAL_ZORVadStrings"));
  if (dlsym(module, "InitModule") == nullptr || mark == nullptr || mark() != 1) return 1;
  return dlclose(module);
}
