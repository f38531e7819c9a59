#include "network/session.h"

#include <filesystem>

namespace zornet {

namespace {

std::vector<std::string> InstalledFolders() {
  std::error_code error;
  const std::filesystem::path root = std::filesystem::read_symlink("/proc/self/exe", error).parent_path().parent_path();
  if (error) return {};
  return {root / "lib" / "zorvadstrings", root / "lib"};
}

}  // namespace

Session::Session(const std::vector<std::string>& folders) {
  for (const std::string& folder : folders) mManager.AddSearchPath(ToZor(folder));
  for (const std::string& folder : InstalledFolders()) mManager.AddSearchPath(ToZor(folder));
  const ZORVaDoModule& numbers = Open("ZORVadNumbers");
  const ZORVaDoModule& strings = Open("ZORVadStrings");
  try {
    mTypes = std::make_unique<zornet::Types>(strings, numbers);
  } catch (const std::runtime_error& error) {
    throw ModuleFailure(error.what());
  }
}

const ZORVaDoModule& Session::Open(const char* name) {
  const ZORVaDoModule* module = mManager.OpenModule(ZORString(name));
  if (module == nullptr) throw ModuleFailure(std::string(ToView(mManager.GetFailure())));
  return *module;
}

}  // namespace zornet
