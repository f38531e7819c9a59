// The modules of the value types, opened by name through the module manager, as a solver does.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "host/ZORSolver.h"
#include "network/values.h"

namespace zornet {

// Values must die before the session in which they were made.
class Session {
 public:
  // Looks for the modules in the program's own folder, in the folders given and in that of the host library. Throws
  // ModuleFailure.
  explicit Session(const std::vector<std::string>& folders = {});

  const zornet::Types& Types() const { return *mTypes; }

 private:
  const ZORVaDoModule& Open(const char* name);

  ZORVaDoModuleManager mManager;
  std::unique_ptr<zornet::Types> mTypes;
};

}  // namespace zornet
