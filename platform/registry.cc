#include "platform/registry.h"

#include <algorithm>
#include <cstdlib>
#include <memory>
#include <mutex>
#include <optional>
#include <unordered_map>
#include <utility>

#include "automation/error.h"
#include "platform/registry_store.h"

namespace platform {

// An opened key remembers its path, not a place in the store, so a store
// replaced while the key is open is read afresh.
struct RegKey {
  HKEY root;
  std::string path;
};

namespace {

constexpr uint32_t kGrantedAccess = kKeyRead | kKeyWow6464Key | kKeyWow6432Key;

struct RegistryState {
  std::mutex mutex;
  bool loaded = false;
  std::optional<RegistryStore> store;  // empty while the last load failed
  std::string load_error;
  // Owning the handles lets a handle be told from a stale or foreign one.
  std::unordered_map<HKEY, std::unique_ptr<RegKey>> open_keys;
};

RegistryState& State() {
  static RegistryState state;
  return state;
}

// Call with the state locked. On failure the registry stays unusable until
// the next load, so every later call answers alike.
void LoadLocked(RegistryState& state, const std::string& path) {
  state.loaded = true;
  try {
    state.store = RegistryStore::Load(path);
    state.load_error.clear();
  } catch (const automation::Error& error) {
    state.store.reset();
    state.load_error = error.Description();
    throw;
  }
}

// The store, loading it on first use; null when the file is malformed.
const RegistryStore* StoreLocked(RegistryState& state) {
  if (!state.loaded) {
    try {
      LoadLocked(state, RegistryFilePath());
    } catch (const automation::Error&) {
      // Kept in load_error; the caller answers kErrorBadDb.
    }
  }
  return state.store ? &*state.store : nullptr;
}

// The root and path `key` stands for, or null for a handle not open.
const RegKey* ResolveLocked(RegistryState& state, HKEY key) {
  static const RegKey kLocalMachine{kHkeyLocalMachine, ""};
  static const RegKey kCurrentUser{kHkeyCurrentUser, ""};
  if (key == kHkeyLocalMachine) return &kLocalMachine;
  if (key == kHkeyCurrentUser) return &kCurrentUser;
  auto found = state.open_keys.find(key);
  return found == state.open_keys.end() ? nullptr : found->second.get();
}

std::string Environment(const char* name) {
  const char* value = std::getenv(name);
  return value == nullptr ? "" : value;
}

}  // namespace

int32_t RegOpenKeyEx(HKEY root, std::string_view sub_key, uint32_t options,
                     uint32_t sam_desired, HKEY* result) {
  if (result == nullptr) return kErrorInvalidParameter;
  *result = nullptr;
  RegistryState& state = State();
  std::lock_guard lock(state.mutex);
  const RegKey* parent = ResolveLocked(state, root);
  if (parent == nullptr) return kErrorInvalidHandle;
  if ((sam_desired & ~kGrantedAccess) != 0) return kErrorAccessDenied;
  const RegistryStore* store = StoreLocked(state);
  if (store == nullptr) return kErrorBadDb;

  std::string path = parent->path;
  if (!path.empty() && !sub_key.empty()) path += '\\';
  path += sub_key;
  if (!store->HasKey(parent->root, path)) return kErrorFileNotFound;
  auto key = std::make_unique<RegKey>(RegKey{parent->root, std::move(path)});
  *result = key.get();
  state.open_keys.emplace(key.get(), std::move(key));
  return kErrorSuccess;
}

int32_t RegQueryValueEx(HKEY key, std::string_view value_name, uint32_t* type,
                        uint8_t* data, uint32_t* size) {
  RegistryState& state = State();
  std::lock_guard lock(state.mutex);
  const RegKey* opened = ResolveLocked(state, key);
  if (opened == nullptr) return kErrorInvalidHandle;
  if (data != nullptr && size == nullptr) return kErrorInvalidParameter;
  const RegistryStore* store = StoreLocked(state);
  if (store == nullptr) return kErrorBadDb;

  const RegistryStore::Value* value =
      store->FindValue(opened->root, opened->path, value_name);
  if (value == nullptr) return kErrorFileNotFound;
  if (type != nullptr) *type = value->type;
  uint32_t needed = static_cast<uint32_t>(value->data.size());
  int32_t result = kErrorSuccess;
  if (data != nullptr) {
    if (*size < needed) {
      result = kErrorMoreData;
    } else {
      std::copy(value->data.begin(), value->data.end(), data);
    }
  }
  if (size != nullptr) *size = needed;
  return result;
}

int32_t RegCloseKey(HKEY key) {
  if (key == kHkeyLocalMachine || key == kHkeyCurrentUser) return kErrorSuccess;
  RegistryState& state = State();
  std::lock_guard lock(state.mutex);
  return state.open_keys.erase(key) == 1 ? kErrorSuccess : kErrorInvalidHandle;
}

std::string RegistryFilePath() {
  std::string path = Environment("KELQLN_REGISTRY");
  if (!path.empty()) return path;
  // A relative XDG_CONFIG_HOME is invalid by the XDG rules and is ignored.
  std::string config = Environment("XDG_CONFIG_HOME");
  if (!config.starts_with('/')) {
    std::string home = Environment("HOME");
    if (home.empty()) return "";
    config = home + "/.config";
  }
  return config + "/kelqln/registry.reg";
}

void LoadRegistry() {
  RegistryState& state = State();
  std::lock_guard lock(state.mutex);
  LoadLocked(state, RegistryFilePath());
}

void UseRegistryFile(const std::string& path) {
  RegistryState& state = State();
  std::lock_guard lock(state.mutex);
  LoadLocked(state, path);
}

void UseRegistryStore(RegistryStore store) {
  RegistryState& state = State();
  std::lock_guard lock(state.mutex);
  state.loaded = true;
  state.store = std::move(store);
  state.load_error.clear();
}

std::string RegistryLoadError() {
  RegistryState& state = State();
  std::lock_guard lock(state.mutex);
  return state.load_error;
}

}  // namespace platform
