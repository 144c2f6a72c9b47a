#include "host/modeltool/add_in_registry.h"

#include <cstdint>
#include <cstring>
#include <optional>
#include <string_view>

#include "automation/error.h"
#include "host/modeltool/add_in_manager.h"
#include "platform/registry.h"

namespace host::modeltool {
namespace {

// An open key, closed on every way out.
class OpenKey {
 public:
  // Nullopt when the key does not exist; a registry that cannot be read is
  // an error.
  static std::optional<OpenKey> Open(const std::string& path) {
    platform::HKEY key = nullptr;
    int32_t result = platform::RegOpenKeyEx(platform::kHkeyLocalMachine, path,
                                            0, platform::kKeyRead, &key);
    if (result == platform::kErrorBadDb) {
      throw automation::Error(automation::kBadFileFormat,
                              platform::RegistryLoadError());
    }
    if (result != platform::kErrorSuccess) return std::nullopt;
    return OpenKey(key);
  }
  OpenKey(OpenKey&& other) noexcept : key_(other.key_) { other.key_ = nullptr; }
  OpenKey(const OpenKey&) = delete;
  OpenKey& operator=(const OpenKey&) = delete;
  OpenKey& operator=(OpenKey&&) = delete;
  ~OpenKey() {
    if (key_ != nullptr) platform::RegCloseKey(key_);
  }

  // The text of a string value; "" when it is missing or of another type.
  std::string Text(std::string_view name) const {
    uint32_t type = 0;
    uint32_t size = 0;
    if (platform::RegQueryValueEx(key_, name, &type, nullptr, &size) !=
            platform::kErrorSuccess ||
        type != platform::kRegSz || size == 0) {
      return "";
    }
    std::string data(size, '\0');
    if (platform::RegQueryValueEx(key_, name, &type,
                                  reinterpret_cast<uint8_t*>(data.data()),
                                  &size) != platform::kErrorSuccess) {
      return "";
    }
    data.resize(std::strlen(data.c_str()));
    return data;
  }

  // A dword value, or `fallback` when it is missing or of another type.
  bool Flag(std::string_view name, bool fallback) const {
    uint32_t type = 0;
    uint8_t data[4] = {};
    uint32_t size = sizeof data;
    if (platform::RegQueryValueEx(key_, name, &type, data, &size) !=
            platform::kErrorSuccess ||
        type != platform::kRegDword || size != sizeof data) {
      return fallback;
    }
    return (data[0] | data[1] | data[2] | data[3]) != 0;
  }

 private:
  explicit OpenKey(platform::HKEY key) : key_(key) {}
  platform::HKEY key_;
};

}  // namespace

std::vector<AddInDescription> ReadAddInDescriptions() {
  std::vector<AddInDescription> descriptions;
  auto list = OpenKey::Open(kAddInsKey);
  if (!list) return descriptions;
  for (int n = 1;; ++n) {
    std::string name = list->Text(std::to_string(n));
    if (name.empty()) break;
    AddInDescription description;
    description.name = name;
    description.registry_key = std::string(kAddInsKey) + "\\" + name;
    if (auto key = OpenKey::Open(description.registry_key)) {
      description.active = key->Flag("Active", true);
      description.language_add_in = key->Flag("LanguageAddIn", false);
      description.server_prog_id = key->Text("ServerProgId");
      description.help_text = key->Text("HelpText");
      description.rte_text = key->Text("RteText");
    }
    descriptions.push_back(std::move(description));
  }
  return descriptions;
}

void LoadAddInsFromRegistry(AddInManager& manager,
                            const std::string& settings_path) {
  for (auto& description : ReadAddInDescriptions()) {
    auto add_in = std::make_shared<AddIn>(std::move(description));
    if (add_in->Name() == kSettingsAddInName) {
      add_in->SetSettingsStore(std::make_shared<SettingsStore>(settings_path));
    }
    manager.Add(std::move(add_in));
  }
}

}  // namespace host::modeltool
