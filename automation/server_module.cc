#include "automation/server_module.h"

#include <dlfcn.h>

#include <utility>

#include "automation/case_folding.h"
#include "automation/error.h"

namespace automation {

ServerModule::ServerModule(std::vector<ServerClass> classes)
    : classes_(std::move(classes)) {
  factories_.reserve(classes_.size());
  for (const ServerClass& server_class : classes_) {
    factories_.emplace_back(&server_class);
  }
}

int32_t ServerModule::Register() {
  for (const ServerClass& server_class : classes_) {
    RegisterClass(server_class.prog_id, server_class.class_id,
                  server_class.factory);
  }
  return kSOk;
}

int32_t ServerModule::Unregister() {
  for (const ServerClass& server_class : classes_) {
    UnregisterClass(server_class.prog_id);
  }
  return kSOk;
}

int32_t ServerModule::GetClassObject(const char* class_id,
                                     const ClassFactory** factory) {
  if (factory == nullptr) return kEPointer;
  *factory = nullptr;
  if (class_id == nullptr) return kClassNotAvailable;
  for (size_t i = 0; i < classes_.size(); ++i) {
    if (EqualsIgnoreCase(classes_[i].class_id, class_id) ||
        EqualsIgnoreCase(classes_[i].prog_id, class_id)) {
      *factory = &factories_[i];
      return kSOk;
    }
  }
  return kClassNotAvailable;
}

int32_t ServerModule::CanUnloadNow() const {
  return live_.load() == 0 ? kSOk : kSFalse;
}

ServerModule::LiveObject::LiveObject(ServerModule& module) : module_(module) {
  ++module_.live_;
}
ServerModule::LiveObject::LiveObject(const LiveObject& other)
    : module_(other.module_) {
  ++module_.live_;
}
ServerModule::LiveObject::~LiveObject() { --module_.live_; }

namespace {

using EntryPoint = int32_t (*)();
using GetClassObjectEntry = int32_t (*)(const char*, const ClassFactory**);

[[noreturn]] void LoadFailure(const std::string& path,
                              const std::string& reason) {
  throw Error(kErrorLoadingDll,
              std::string(StandardDescription(kErrorLoadingDll)) + " '" +
                  path + "': " + reason);
}

}  // namespace

ServerLibrary::ServerLibrary(std::string path, void* handle)
    : path_(std::move(path)), handle_(handle) {}

ServerLibrary::ServerLibrary(ServerLibrary&& other) noexcept
    : path_(std::move(other.path_)), handle_(std::exchange(other.handle_, nullptr)) {}

ServerLibrary ServerLibrary::Load(const std::string& path) {
  void* handle = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL);
  if (handle == nullptr) {
    const char* reason = dlerror();
    LoadFailure(path, reason ? reason : "unknown reason");
  }
  ServerLibrary library(path, handle);
  for (const char* name : {"DllRegisterServer", "DllUnregisterServer",
                           "DllGetClassObject", "DllCanUnloadNow"}) {
    if (library.Symbol(name) == nullptr) {
      LoadFailure(path, std::string("no entry point ") + name);
    }
  }
  if (library.Register() != kSOk) LoadFailure(path, "registration failed");
  return library;
}

void* ServerLibrary::Symbol(const char* name) const {
  return handle_ ? dlsym(handle_, name) : nullptr;
}

int32_t ServerLibrary::Register() const {
  return reinterpret_cast<EntryPoint>(Symbol("DllRegisterServer"))();
}

int32_t ServerLibrary::Unregister() const {
  return reinterpret_cast<EntryPoint>(Symbol("DllUnregisterServer"))();
}

int32_t ServerLibrary::CanUnloadNow() const {
  return reinterpret_cast<EntryPoint>(Symbol("DllCanUnloadNow"))();
}

const ClassFactory* ServerLibrary::GetClassObject(
    const std::string& class_id) const {
  const ClassFactory* factory = nullptr;
  auto entry =
      reinterpret_cast<GetClassObjectEntry>(Symbol("DllGetClassObject"));
  return entry(class_id.c_str(), &factory) == kSOk ? factory : nullptr;
}

}  // namespace automation
