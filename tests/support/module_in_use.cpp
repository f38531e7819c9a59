// Takes the module that the test is linked with into use, as the solver does, before the first test runs.
#include <gtest/gtest.h>

#include "host/ZORSolver.h"
#include "module/InitModule.h"

namespace {

class ModuleInUse : public testing::Environment {
 public:
  void SetUp() override { ASSERT_EQ(InitModule(&mModule, &mManager), 1); }

 private:
  ZORVaDoModuleManager mManager;
  ZORVaDoModule mModule{ZORString("ZORVadStrings")};
};

const auto* const kEnvironment = testing::AddGlobalTestEnvironment(new ModuleInUse);

}  // namespace
