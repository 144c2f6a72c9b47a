#include "host/modeltool/settings_store.h"

#include <cstdlib>
#include <filesystem>
#include <nlohmann/json.hpp>
#include <system_error>

#include "automation/case_folding.h"
#include "automation/error.h"
#include "host/modeltool/atomic_file.h"

namespace host::modeltool {
namespace {

using Json = nlohmann::ordered_json;

// Settings are a handful of short texts; anything larger is no settings file.
constexpr size_t kMaxSettingsFileSize = 4 * 1024 * 1024;

Json ReadSettings(const std::string& path) {
  std::error_code error;
  if (!std::filesystem::exists(path, error)) return Json::object();
  std::string text = ReadWholeFile(path, kMaxSettingsFileSize);
  Json settings = Json::parse(text, nullptr, false);
  if (settings.is_discarded() || !settings.is_object()) {
    throw automation::Error(automation::kBadFileFormat,
                            path + ": not a JSON object of sections");
  }
  for (const auto& [section, keys] : settings.items()) {
    if (!keys.is_object()) {
      throw automation::Error(
          automation::kBadFileFormat,
          path + ": section '" + section + "' is not an object of keys");
    }
    for (const auto& [key, value] : keys.items()) {
      if (!value.is_string()) {
        throw automation::Error(
            automation::kBadFileFormat,
            path + ": value '" + section + "/" + key + "' is not a text");
      }
    }
  }
  return settings;
}

// The member of `object` whose name matches `name` without regard to case.
Json* FindMember(Json& object, const std::string& name) {
  for (auto& [member, value] : object.items()) {
    if (automation::EqualsIgnoreCase(member, name)) return &value;
  }
  return nullptr;
}

}  // namespace

std::string SettingsStore::DefaultPath() {
  if (const char* path = std::getenv("KELQLN_SETTINGS"); path && *path) {
    return path;
  }
  std::filesystem::path base;
  if (const char* config = std::getenv("XDG_CONFIG_HOME"); config && *config) {
    base = config;
  } else if (const char* home = std::getenv("HOME"); home && *home) {
    base = std::filesystem::path(home) / ".config";
  } else {
    base = ".";
  }
  return (base / "kelqln" / "settings.json").string();
}

std::string SettingsStore::Read(const std::string& section,
                                const std::string& key,
                                const std::string& fallback) const {
  Json settings = ReadSettings(path_);
  Json* keys = FindMember(settings, section);
  Json* value = keys ? FindMember(*keys, key) : nullptr;
  return value ? value->get<std::string>() : fallback;
}

void SettingsStore::Write(const std::string& section, const std::string& key,
                          const std::string& value) {
  Json settings = ReadSettings(path_);
  Json* keys = FindMember(settings, section);
  if (keys == nullptr) keys = &(settings[section] = Json::object());
  if (Json* present = FindMember(*keys, key)) {
    *present = value;
  } else {
    (*keys)[key] = value;
  }
  std::filesystem::path directory = std::filesystem::path(path_).parent_path();
  if (!directory.empty()) {
    std::error_code error;
    std::filesystem::create_directories(directory, error);
    if (error) {
      throw automation::Error(
          automation::kPathFileAccessError,
          path_ + ": cannot make its directory (" + error.message() + ")");
    }
  }
  WriteFileAtomically(path_, settings.dump(2) + "\n");
}

}  // namespace host::modeltool
