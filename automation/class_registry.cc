#include "automation/class_registry.h"

#include <memory>
#include <mutex>
#include <unordered_map>

#include "automation/case_folding.h"
#include "automation/error.h"

namespace automation {
namespace {

struct ClassEntry {
  std::string prog_id;
  std::string class_id;
  Factory factory;
};

struct Registry {
  std::mutex mutex;
  // Both names of a class lead to one shared entry.
  std::unordered_map<std::string, std::shared_ptr<ClassEntry>, FoldedHash,
                     FoldedEqual>
      by_name;
};

Registry& TheRegistry() {
  static Registry* registry = new Registry;  // lives as long as the process
  return *registry;
}

}  // namespace

void RegisterClass(std::string prog_id, std::string class_id,
                   Factory factory) {
  Registry& registry = TheRegistry();
  std::lock_guard lock(registry.mutex);
  auto entry = std::make_shared<ClassEntry>(
      ClassEntry{prog_id, class_id, std::move(factory)});
  registry.by_name[prog_id] = entry;
  if (!class_id.empty()) registry.by_name[class_id] = entry;
}

bool UnregisterClass(std::string_view prog_id) {
  Registry& registry = TheRegistry();
  std::lock_guard lock(registry.mutex);
  auto found = registry.by_name.find(prog_id);
  if (found == registry.by_name.end()) return false;
  std::shared_ptr<ClassEntry> entry = found->second;
  registry.by_name.erase(found);
  if (!entry->class_id.empty()) {
    auto by_id = registry.by_name.find(entry->class_id);
    if (by_id != registry.by_name.end() && by_id->second == entry) {
      registry.by_name.erase(by_id);
    }
  }
  return true;
}

bool IsClassRegistered(std::string_view prog_id_or_class_id) {
  Registry& registry = TheRegistry();
  std::lock_guard lock(registry.mutex);
  return registry.by_name.count(prog_id_or_class_id) != 0;
}

Object CreateObject(std::string_view prog_id_or_class_id) {
  Factory factory;
  {
    Registry& registry = TheRegistry();
    std::lock_guard lock(registry.mutex);
    auto found = registry.by_name.find(prog_id_or_class_id);
    if (found == registry.by_name.end()) {
      throw Error(kCannotCreateObject,
                  std::string(StandardDescription(kCannotCreateObject)) +
                      ": " + std::string(prog_id_or_class_id));
    }
    factory = found->second->factory;
  }
  // Outside the lock: a factory may create further objects.
  return factory();
}

}  // namespace automation
