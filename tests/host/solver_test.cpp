#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "host/ZORNumbers.h"
#include "host/ZORSolver.h"

namespace {

std::string TextOf(const ZORString& text) { return text.CastToCharPtr(); }

std::vector<std::string> sEvents;  // "-" and the text of each record that went

void Watch(const ZORStreamableClass& record, bool added) {
  if (!added) sEvents.push_back(record.Text());
}

class Manager : public testing::Test {
 protected:
  void SetUp() override {
    sEvents.clear();
    ZORStreamableClass::Watch(Watch);
  }
  void TearDown() override { ZORStreamableClass::Watch(nullptr); }

  std::string FailureOf(const char* name) {
    EXPECT_EQ(mManager->OpenModule(name), nullptr) << name;
    return TextOf(mManager->GetFailure());
  }

  std::unique_ptr<ZORVaDoModuleManager> mManager = std::make_unique<ZORVaDoModuleManager>();
};

class Folder {
 public:
  Folder() { std::filesystem::create_directory(mPath); }
  ~Folder() { std::filesystem::remove_all(mPath); }
  std::string Path() const { return mPath.string(); }

 private:
  std::filesystem::path mPath = std::filesystem::temp_directory_path() / ("zor_host_tests_" + std::to_string(getpid()));
};

}  // namespace

TEST_F(Manager, TellsWhyAModuleCannotBeOpened) {
  const Folder folder;
  const std::string file = folder.Path() + "/libBroken.so";
  std::ofstream(file) << "no library";
  mManager->AddSearchPath(folder.Path().c_str());

  // The modules of the tests, the test program and the host library share a folder, which is named once.
  const std::string own = std::filesystem::canonical("/proc/self/exe").parent_path();
  EXPECT_EQ(FailureOf("Unknown"), "libUnknown.so: not found in " + own + ", " + folder.Path());
  EXPECT_EQ(FailureOf(""), "lib.so: not the name of a module");
  EXPECT_EQ(FailureOf("../bin/ProbeAlone"), "lib../bin/ProbeAlone.so: not the name of a module");
  EXPECT_EQ(FailureOf(".."), "lib...so: not the name of a module");
  EXPECT_EQ(FailureOf("Broken"), file + ": file too short");
  const std::string probe = own + "/libProbeAlone.so", foreign = folder.Path() + "/libForeign.so";
  std::filesystem::copy_file(probe, foreign);
  std::fstream(foreign, std::ios::in | std::ios::out | std::ios::binary).seekp(18).write("\xff\xfe", 2);  // the machine
  EXPECT_NE(FailureOf("Foreign").find(foreign + ": "), std::string::npos);
  EXPECT_NE(FailureOf("ProbeWithoutEntry").find("libProbeWithoutEntry.so: has no InitModule"), std::string::npos);
  EXPECT_NE(FailureOf("ProbeRefuses").find("/libProbeRefuses.so: InitModule answered 0"), std::string::npos);

  EXPECT_NE(mManager->OpenModule("ZORVadNumbers"), nullptr);
  EXPECT_EQ(TextOf(mManager->GetFailure()), "");
}

TEST_F(Manager, UnloadsAModuleThatRefuses) {
  FailureOf("ProbeRefuses");
  EXPECT_EQ(sEvents,
            (std::vector<std::string>{"registered", "not registered", "of the library itself", "ProbeRefuses"}));
  EXPECT_EQ(ZORStreamableClass::Find("ProbeRefuses"), nullptr);
}

TEST_F(Manager, OpensAModuleOnce) {
  ZORVaDoModule* module = mManager->OpenModule("ProbeAlone");
  ASSERT_NE(module, nullptr) << TextOf(mManager->GetFailure());
  EXPECT_EQ(mManager->OpenModule("ProbeAlone"), module);
  ASSERT_EQ(module->GetDescriptors().size(), 1u);
  EXPECT_EQ(module->FindDescriptor("registered"), module->GetDescriptors()[0]);
  EXPECT_EQ(module->FindDescriptor("not registered"), nullptr);
}

TEST_F(Manager, ModulesMayNeedEachOther) {
  ZORVaDoModule* first = mManager->OpenModule("ProbeNeedsNext");
  ZORVaDoModule* next = mManager->OpenModule("ProbeNext");
  ASSERT_NE(first, nullptr) << TextOf(mManager->GetFailure());
  EXPECT_EQ(first->GetLoadedModules(), std::vector<ZORVaDoModule*>{next});
  EXPECT_EQ(next->GetLoadedModules(), std::vector<ZORVaDoModule*>{first});
  mManager.reset();
  const std::vector<std::string> unload{"registered", "not registered", "of the library itself"};
  ASSERT_EQ(sEvents.size(), 8u);
  EXPECT_EQ(sEvents[3], "ProbeNeedsNext") << "what needed the other goes first";
  EXPECT_EQ(sEvents[7], "ProbeNext");
}

TEST_F(Manager, DescriptorsLiveAsLongAsTheirLibrary) {
  ZORVaDoModuleManager other;
  ASSERT_NE(mManager->OpenModule("ProbeAlone"), nullptr);
  ASSERT_NE(other.OpenModule("ProbeAlone"), nullptr);
  mManager.reset();
  EXPECT_TRUE(sEvents.empty());
}

TEST_F(Manager, NothingIsLeftOfAModule) {
  for (int i = 0; i < 1000; ++i) ASSERT_NE(ZORVaDoModuleManager().OpenModule("ProbeAlone"), nullptr);
  std::ostringstream maps;
  maps << std::ifstream("/proc/self/maps").rdbuf();
  EXPECT_EQ(maps.str().find("libProbeAlone"), std::string::npos);
}

TEST_F(Manager, ADescriptorThatIsDeletedEarlierIsForgotten) {
  ZORVaDoModule* module = mManager->OpenModule("ProbeAlone");
  ASSERT_NE(module, nullptr);
  delete module->FindDescriptor("registered");
  EXPECT_TRUE(module->GetDescriptors().empty());
  mManager.reset();
  EXPECT_EQ(sEvents, (std::vector<std::string>{"registered", "not registered", "of the library itself", "ProbeAlone"}));
}

TEST(Module, KeepsWhatItIsGivenInOrder) {
  ZORVaDoModule module("m"), a("a"), b("b");
  module.AddLoadedModule(&b);
  module.AddLoadedModule(nullptr);
  module.AddLoadedModule(&a);
  EXPECT_EQ(module.GetLoadedModules(), (std::vector<ZORVaDoModule*>{&b, &a}));
  module.AddObjectDescriptor(nullptr);
  module.AddObjectDescriptor(ZORVadEnumInteger::sDescriptor);
  module.AddObjectDescriptor(ZORVadSingleInteger::sDescriptor);
  EXPECT_EQ(module.GetDescriptors(), (std::vector<const ZORVaDoObjectDescriptor*>{ZORVadEnumInteger::sDescriptor,
                                                                                  ZORVadSingleInteger::sDescriptor}));
}

TEST(Numbers, AreBuiltIn) {
  ZORVaDoModuleManager manager;
  ZORVaDoModule* numbers = manager.OpenModule("ZORVadNumbers");
  ASSERT_NE(numbers, nullptr);
  EXPECT_EQ(manager.OpenModule("ZORVadNumbers"), numbers);
  std::vector<std::string> names;
  for (const auto* descriptor : numbers->GetDescriptors()) names.push_back(TextOf(descriptor->GetName()));
  EXPECT_EQ(names, (std::vector<std::string>{"single boolean", "single integer", "interval integer", "enum integer"}));
}

TEST(Descriptor, KnowsItsTypeAndThoseBelow) {
  const ZORVaDoObjectDescriptor* scalar = ZORVaDoScalar::sDescriptor;
  EXPECT_EQ(TextOf(scalar->GetName()), "scalar");
  EXPECT_EQ(scalar->GetFlag(), 1);
  EXPECT_EQ(scalar->GetParent(), nullptr);
  EXPECT_EQ(scalar->CreateObject(nullptr), nullptr);

  EXPECT_EQ(scalar->IsMatched(scalar), 1);
  EXPECT_EQ(scalar->IsMatched(ZORVadEnumInteger::sDescriptor), 1);
  EXPECT_EQ(scalar->IsMatched(ZORVadSingleBoolean::sDescriptor), 0);
  EXPECT_EQ(ZORVadEnumInteger::sDescriptor->IsMatched(scalar), 0);
  EXPECT_EQ(scalar->IsMatched(nullptr), 0);
}

TEST(TypeTest, FollowsTheClassTreeByAddress) {
  const ZORVadSingleInteger single;
  const char* const above[] = {ZORVaDoInteger::sIdent, ZORVaDoScalar::sIdent, ZORVaDoAny::sIdent,
                               ZORVaDoObject::sIdent,  ZORVaDoBase::sIdent,   ZORVadSingleInteger::sIdent};
  for (const char* ident : above) {
    EXPECT_TRUE(ZORVaDoBase::IsKindOf(&single, ident)) << ident;
    EXPECT_FALSE(ZORVaDoBase::IsKindOf(nullptr, ident)) << ident;
    EXPECT_FALSE(ZORVaDoBase::IsKindOf(&single, std::string(ident).c_str())) << "an equal text elsewhere";
  }
  EXPECT_FALSE(ZORVaDoBase::IsKindOf(&single, ZORVadEnumInteger::sIdent));
  EXPECT_FALSE(ZORVaDoBase::IsKindOf(&single, ZORVaDoBoolean::sIdent));
  EXPECT_TRUE(ZORVaDoBase::IsKindOf(ZORVaDoScalar::sDescriptor, ZORVaDoObjectDescriptor::sIdent));
  EXPECT_FALSE(ZORVaDoBase::IsKindOf(ZORVaDoScalar::sDescriptor, ZORVaDoObject::sIdent));
}
