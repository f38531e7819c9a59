#include "network/session.h"

#include <mutex>

namespace zornet {

namespace {

std::mutex& Opening() {
  static std::mutex mutex;
  return mutex;
}

}  // namespace

// Modules come and go in one thread at a time.
std::shared_ptr<const Session> Session::Open(const std::vector<std::string>& folders) {
  static std::weak_ptr<const Session> shared;
  const std::lock_guard lock(Opening());
  std::shared_ptr<const Session> session = shared.lock();
  if (session != nullptr) return session;
  session = {new Session(folders), [](const Session* last) {
               const std::lock_guard end(Opening());
               delete last;
             }};
  shared = session;
  return session;
}

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
