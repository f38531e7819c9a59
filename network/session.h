// The modules of the value types, opened by name through the module manager, as a solver does.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "host/ZORSolver.h"
#include "network/values.h"

namespace zornet {

// Values must die before the session in which they were made. All networks of a process share one, as opening a module
// anew would write what values in other threads read.
class Session {
 public:
  // Looks for the modules in the program's own folder, in the folders given and in that of the host library, unless
  // there is a session already. Throws ModuleFailure.
  static std::shared_ptr<const Session> Open(const std::vector<std::string>& folders);

  const zornet::Types& Types() const { return *mTypes; }

 private:
  explicit Session(const std::vector<std::string>& folders);
  const ZORVaDoModule& Open(const char* name);

  ZORVaDoModuleManager mManager;
  std::unique_ptr<zornet::Types> mTypes;
};

}  // namespace zornet
