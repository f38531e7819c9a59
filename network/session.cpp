#include "network/session.h"

namespace zornet {

Session::Session(const std::vector<std::string>& folders) {
  for (const std::string& folder : folders) mManager.AddSearchPath(ToZor(folder));
  const ZORVaDoModule& numbers = Open("ZORVadNumbers");
  mTypes = std::make_unique<zornet::Types>(Open("ZORVadStrings"), numbers);
}

const ZORVaDoModule& Session::Open(const char* name) {
  const ZORVaDoModule* module = mManager.OpenModule(ZORString(name));
  if (module == nullptr) throw ModuleFailure(std::string(ToView(mManager.GetFailure())));
  return *module;
}

}  // namespace zornet
