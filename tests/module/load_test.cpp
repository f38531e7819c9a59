// The module as the solver gets it: loaded, taken into use, unloaded.
#include <dlfcn.h>
#include <gtest/gtest.h>

#include <array>
#include <string>
#include <vector>

#include "host/ZORSolver.h"

namespace {

using Log = std::vector<std::string>;
Log sLog;

void Tell(const char* what, const ZORString& name) { sLog.emplace_back(what).append(name.CastToCharPtr()); }

struct Library {
  ~Library() { dlclose(handle); }

  template <class Symbol>
  Symbol* Find(const char* name) {
    void* const symbol = dlsym(handle, name);
    EXPECT_NE(symbol, nullptr) << name;
    return reinterpret_cast<Symbol*>(symbol);
  }
  const ZORVaDoObjectDescriptor* Descriptor(const char* name) { return *Find<const ZORVaDoObjectDescriptor*>(name); }
  int Length(const char* text) {
    return Find<ZORString>((std::string("_ZN13ZORVaDoString16ZorVaDoString") + text + "E").c_str())->GetLengthInChar();
  }
  std::array<int, 4> Lengths() { return {Length("Min"), Length("Max"), Length("Any"), Length("Nil")}; }

  void* const handle = dlopen(ZOR_MODULE_FILE, RTLD_NOW | RTLD_LOCAL);
};

constexpr char kString[] = "_ZN13ZORVaDoString11sDescriptorE", kSingle[] = "_ZN18ZORVadSingleString11sDescriptorE",
               kEnum[] = "_ZN16ZORVadEnumString11sDescriptorE";
using InitModule = int(ZORVaDoModule*, ZORVaDoModuleManager*);

// A module object and a manager that tell what they are asked.
struct Module : ZORVaDoModule {
  Module() : ZORVaDoModule("ZORVadStrings") {}
  void AddLoadedModule(ZORVaDoModule* module) override { Tell("needs ", module->GetName()); }
  void AddObjectDescriptor(const ZORVaDoObjectDescriptor* made) override { Tell("", made->GetName()); }
};
struct Manager : ZORVaDoModuleManager {
  explicit Manager(ZORVaDoModule* module) : answer(module) {}
  ZORVaDoModule* OpenModule(const ZORString& name) override { return Tell("open ", name), answer; }
  ZORVaDoModule* answer;
};

struct ModuleLoad : testing::Test {
  ModuleLoad() { sLog.clear(); }
  Module module;
  ZORVaDoModule numbers{ZORString("ZORVadNumbers")};
};

TEST_F(ModuleLoad, ClassesComeAndGoInOrder) {
  ZORStreamableClass::Watch([](const ZORStreamableClass& record, bool added) {
    sLog.emplace_back(1, added ? '+' : '-').append(record.Text()).append(" ").append(std::to_string(record.Kind()));
  });
  { const Library library; }
  ZORStreamableClass::Watch(nullptr);
  EXPECT_EQ(sLog, (Log{"+ZORVaDoString_Descriptor 1", "+ZORVaDoString 1", "+ZORVadEnumString_Descriptor 1",
                       "+ZORVadEnumString 1", "+ZORVadSingleString_Descriptor 1", "+ZORVadSingleString 1",
                       "-ZORVadSingleString 1", "-ZORVadSingleString_Descriptor 1", "-ZORVadEnumString 1",
                       "-ZORVadEnumString_Descriptor 1", "-ZORVaDoString 1", "-ZORVaDoString_Descriptor 1"}));
}

// Not without the solver and the numbers.
TEST_F(ModuleLoad, TakenIntoUse) {
  Library library;
  auto* const init = library.Find<InitModule>("InitModule");
  Manager able(&numbers), unable(nullptr);
  EXPECT_EQ(init(nullptr, &able) + init(&module, nullptr) + init(nullptr, nullptr), 0);
  EXPECT_EQ(sLog, Log());
  EXPECT_EQ(init(&module, &unable), 0);
  for (const char* name : {kString, kSingle, kEnum}) EXPECT_EQ(library.Descriptor(name), nullptr) << name;
  EXPECT_EQ(library.Lengths(), (std::array{0, 0, 0, 0}));
  EXPECT_EQ(init(&module, &able), 1);
  EXPECT_EQ(sLog,
            (Log{"open ZORVadNumbers", "open ZORVadNumbers", "needs ZORVadNumbers", "single string", "enum string"}));
  EXPECT_EQ(library.Lengths(), (std::array{1, 255, 256, 0}));
  library.Find<void()>("_Z11InitStringsv")();
  EXPECT_EQ(library.Lengths(), (std::array{1, 255, 256, 0}));
  EXPECT_EQ(library.Find<int()>("TARVOS_WORKSHOP_BDK2_INTERNAL_ZORVadStrings")(), 1);
  for (const char* name : {kSingle, kEnum})
    EXPECT_EQ(library.Descriptor(name)->GetParent(), library.Descriptor(kString));
  for (const char* name : {kSingle, kEnum, kString}) delete library.Descriptor(name);
}

// Through the manager, with a value made while the module is there; nothing of it is left afterwards.
TEST_F(ModuleLoad, OpenedAndClosedByTheSolver) {
  {
    ZORVaDoModuleManager manager;
    ZORVaDoModule* const opened = manager.OpenModule("ZORVadStrings");
    ASSERT_NE(opened, nullptr) << manager.GetFailure().CastToCharPtr();
    EXPECT_EQ(manager.OpenModule("ZORVadStrings"), opened);
    EXPECT_EQ(opened->GetLoadedModules(), std::vector{manager.OpenModule("ZORVadNumbers")});
    for (const char* name : {"single string", "enum string"}) {
      const ZORVaDoObjectDescriptor* const type = opened->FindDescriptor(name);
      ASSERT_NE(type, nullptr) << name;
      std::vector<std::max_align_t> place(type->GetObjectSize() / sizeof(std::max_align_t) + 1);
      ZORostrstream out;
      ZORVaDoObject* value = type->CreateObject(place.data());
      value->PrintOn(out);
      type->DestroyObject(value);
      EXPECT_EQ(out.View(), "Any") << name;
    }
    EXPECT_EQ(opened->FindDescriptor("string"), nullptr);
  }
  EXPECT_EQ(ZORStreamableClass::Find("ZORVadSingleString"), nullptr);
}

}  // namespace
