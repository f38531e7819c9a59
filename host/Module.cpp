#include <dlfcn.h>
#include <sys/auxv.h>
#include <unistd.h>

#include <algorithm>
#include <climits>
#include <filesystem>
#include <utility>

#include "host/Descriptors.h"
#include "host/ZORSolver.h"

namespace {

constexpr char kNumbers[] = "ZORVadNumbers";
constexpr char kEntry[] = "InitModule";

using Entry = int (*)(ZORVaDoModule* module, ZORVaDoModuleManager* manager);

constinit ZORVaDoModule* sInUse = nullptr;            // the module that is being opened
constinit ZORVaDoModuleManager* sManagers = nullptr;  // every live manager

// While in scope, new descriptors are owned by module, or by nobody when it is null.
class TakingIntoUse {
 public:
  explicit TakingIntoUse(ZORVaDoModule* module) : mBefore(std::exchange(sInUse, module)) {}
  ~TakingIntoUse() { sInUse = mBefore; }
  TakingIntoUse(const TakingIntoUse&) = delete;
  TakingIntoUse& operator=(const TakingIntoUse&) = delete;

 private:
  ZORVaDoModule* mBefore;
};

// Links are followed. Empty when there is no such file.
std::string FolderOf(const char* file) {
  std::error_code error;
  if (file == nullptr) return "";
  return std::filesystem::canonical(file, error).parent_path().string();
}

// Without /proc, as in a bare root folder, the kernel still tells under which name it started the program.
std::string ProgramFolder() {
  std::string folder = FolderOf("/proc/self/exe");
  if (!folder.empty()) return folder;
  return FolderOf(reinterpret_cast<const char*>(getauxval(AT_EXECFN)));  // NOLINT(performance-no-int-to-ptr)
}

// Where this library is, and installed modules beside it.
std::string HostFolder() {
  Dl_info info;
  return dladdr(&sManagers, &info) != 0 ? FolderOf(info.dli_fname) : "";
}

// Descriptors that are static objects of the library are not owned by a module.
void* OpenLibrary(const std::string& file) {
  const TakingIntoUse nobody(nullptr);
  return dlopen(file.c_str(), RTLD_NOW | RTLD_LOCAL);
}

// The loader's last error, without the file name that it often begins with.
std::string LoaderReason(const std::string& file) {
  const char* text = dlerror();
  std::string reason = text != nullptr ? text : "unknown reason";
  if (reason.starts_with(file + ": ")) reason.erase(0, file.size() + 2);
  return reason;
}

std::string TextOf(const ZORString& string) {
  return std::string(string.CastToCharPtr(), static_cast<std::size_t>(string.GetLengthInChar()));
}

}  // namespace

ZORVaDoModule::ZORVaDoModule(const ZORString& name) : mName(name) {}

ZORVaDoModule::~ZORVaDoModule() {
  while (!mMade.empty()) delete mMade.back();
}

void ZORVaDoModule::AddLoadedModule(ZORVaDoModule* module) {
  if (module != nullptr) mLoadedModules.push_back(module);
}

void ZORVaDoModule::AddObjectDescriptor(const ZORVaDoObjectDescriptor* descriptor) {
  if (descriptor != nullptr) mDescriptors.push_back(descriptor);
}

const ZORVaDoObjectDescriptor* ZORVaDoModule::FindDescriptor(const ZORString& displayName) const {
  const auto found = std::find_if(mDescriptors.begin(), mDescriptors.end(),
                                  [&](const auto* descriptor) { return descriptor->GetName() == displayName; });
  return found != mDescriptors.end() ? *found : nullptr;
}

void ZORVaDoModule::Adopt(ZORVaDoObjectDescriptor& descriptor) {
  if (sInUse == nullptr) return;
  descriptor.mOwner = sInUse;
  sInUse->mMade.push_back(&descriptor);
}

void ZORVaDoModule::Forget(const ZORVaDoObjectDescriptor& descriptor) {
  std::erase(mMade, &descriptor);
  std::erase(mDescriptors, &descriptor);
}

void ZORVaDoModule::Bequeath(ZORVaDoModule& heir) {
  for (ZORVaDoObjectDescriptor* descriptor : mMade) descriptor->mOwner = &heir;
  heir.mMade.insert(heir.mMade.end(), mMade.begin(), mMade.end());
  mMade.clear();
}

ZORVaDoModuleManager::ZORVaDoModuleManager()
    : mSearchPath{ProgramFolder(), HostFolder()}, mNext(std::exchange(sManagers, this)) {}

ZORVaDoModuleManager::~ZORVaDoModuleManager() {
  ZORVaDoModuleManager** link = &sManagers;
  while (*link != this) link = &(*link)->mNext;
  *link = mNext;
  while (!mOpened.empty()) {
    const Opened last = mOpened.back();
    mOpened.pop_back();
    Unload(last);
  }
}

void ZORVaDoModuleManager::AddSearchPath(const ZORString& folder) {
  mSearchPath.insert(mSearchPath.end() - 1, TextOf(folder));
}

ZORVaDoModule* ZORVaDoModuleManager::OpenModule(const ZORString& name) {
  mFailure = ZORString();
  for (const Opened& opened : mOpened) {
    if (opened.module->GetName() == name) return opened.module;
  }
  if (name == kNumbers) return OpenNumbers(name);
  const std::string file = "lib" + TextOf(name) + ".so";
  const std::string_view asked = name.View();
  if (asked.empty() || asked.find('/') != asked.npos || asked.find("..") != asked.npos)
    return Fail(file, "not the name of a module");
  std::string places;
  for (auto folder = mSearchPath.begin(); folder != mSearchPath.end(); ++folder) {
    if (folder->empty() || std::find(mSearchPath.begin(), folder, *folder) != folder) continue;
    const std::string path = *folder + "/" + file;
    if (access(path.c_str(), F_OK) == 0) return Load(name, path);
    places.append(places.empty() ? "" : ", ").append(*folder);
  }
  return Fail(file, "not found in " + places);
}

ZORVaDoModule* ZORVaDoModuleManager::OpenNumbers(const ZORString& name) {
  auto* module = new ZORVaDoModule(name);
  zorhost::AddNumberDescriptors(*module);
  mOpened.push_back({module, nullptr});
  return module;
}

ZORVaDoModule* ZORVaDoModuleManager::Load(const ZORString& name, const std::string& file) {
  void* library = OpenLibrary(file);
  if (library == nullptr) return Fail(file, LoaderReason(file));
  const Opened opened{new ZORVaDoModule(name), library};
  mOpened.push_back(opened);  // before it is initialised: modules may need each other
  std::string reason = TakeIntoUse(*opened.module, library);
  const auto place =
      std::find_if(mOpened.begin(), mOpened.end(), [&](const Opened& other) { return other.module == opened.module; });
  if (reason.empty()) {
    std::rotate(place, place + 1, mOpened.end());  // after the modules it needs, to be unloaded before them
    return opened.module;
  }
  mOpened.erase(place);
  for (const Opened& other : mOpened) std::erase(other.module->mLoadedModules, opened.module);
  Unload(opened);
  return Fail(file, reason);
}

// Returns why the module cannot be used; empty on success.
std::string ZORVaDoModuleManager::TakeIntoUse(ZORVaDoModule& module, void* library) {
  const auto entry = reinterpret_cast<Entry>(dlsym(library, kEntry));
  if (entry == nullptr) return std::string("has no ") + kEntry;
  const TakingIntoUse scope(&module);
  if (entry(&module, this) != 0) return "";
  const std::string cause = mFailure == "" ? "" : " (" + TextOf(mFailure) + ")";
  return std::string(kEntry) + " answered 0" + cause;
}

// A library stays loaded while another manager uses it; that manager's module then inherits the descriptors.
void ZORVaDoModuleManager::Unload(const Opened& opened) {
  for (const auto* manager = sManagers; manager != nullptr && opened.library != nullptr; manager = manager->mNext) {
    for (const Opened& other : manager->mOpened) {
      if (other.library == opened.library) opened.module->Bequeath(*other.module);
    }
  }
  delete opened.module;
  if (opened.library != nullptr) dlclose(opened.library);
}

ZORVaDoModule* ZORVaDoModuleManager::Fail(const std::string& file, const std::string& reason) {
  const std::string text = file + ": " + reason;
  mFailure = ZORString(text.data(), text.size());
  return nullptr;
}
