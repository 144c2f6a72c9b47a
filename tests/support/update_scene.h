// A place for whole update runs: a temporary directory with a model file and
// the code descriptions of its components, a registry that installs the
// settings add-in "VisualStudio" and one description add-in per language,
// with the debug log of category 5 (levels error and trace) in a file and no
// pause between projects, and the modelling tool with those add-ins and the
// model as its current one.
#ifndef KELQLN_TESTS_SUPPORT_UPDATE_SCENE_H_
#define KELQLN_TESTS_SUPPORT_UPDATE_SCENE_H_

#include <unistd.h>

#include <cstdint>
#include <filesystem>
#include <fstream>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/collection.h"
#include "host/codeview/registration.h"
#include "host/modeltool/add_in.h"
#include "host/modeltool/add_in_manager.h"
#include "host/modeltool/add_in_registry.h"
#include "host/modeltool/application.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/model.h"
#include "host/modeltool/unique_id.h"
#include "host/strings/string_service.h"
#include "platform/registry.h"
#include "platform/registry_store.h"

namespace testing_support {

using Lines = std::vector<std::string>;

inline std::string ReadFile(const std::filesystem::path& path) {
  std::ifstream in(path, std::ios::binary);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

inline void WriteFile(const std::filesystem::path& path,
                      const std::string& text) {
  std::ofstream(path, std::ios::binary) << text;
}

// The texts of a collection object, in order.
inline Lines TextsOf(const automation::Variant& collection) {
  Lines texts;
  for (const automation::Variant& item :
       automation::CollectionItems(automation::CObj(collection))) {
    texts.push_back(automation::CStr(item));
  }
  return texts;
}

class UpdateScene {
 public:
  static constexpr char kSettingsAddIn[] = "VisualStudio";

  // A language add-in: by default the description add-in, active.
  struct Language {
    std::string name;
    std::string server_prog_id = host::codeview::kDescriptionProgId;
    bool active = true;
  };

  // `name` names the directory; `debug_log` is the debug log's file (a
  // process that loads the system once keeps the first one it is given).
  UpdateScene(const std::string& name, const std::vector<Language>& languages,
              const std::filesystem::path& debug_log = {})
      : directory_(std::filesystem::temp_directory_path() /
                   ("kelqln-" + name + "-" + std::to_string(::getpid()))),
        debug_log_(debug_log.empty() ? directory_ / "debug.txt" : debug_log) {
    std::filesystem::remove_all(directory_);
    std::filesystem::create_directories(directory_);
    host::strings::RegisterStringService();
    host::codeview::RegisterCodeViewClasses();
    auto hklm = platform::kHkeyLocalMachine;
    std::vector<std::string> add_ins{kSettingsAddIn};
    for (const Language& language : languages) add_ins.push_back(language.name);
    for (size_t i = 0; i < add_ins.size(); ++i) {
      registry_.SetString(hklm, host::modeltool::kAddInsKey,
                          std::to_string(i + 1), add_ins[i]);
    }
    SetSetting(kSettingsAddIn, "Debug", (1u << 5) | (1u << 25) | (1u << 28));
    SetSetting(kSettingsAddIn, "DebugOutputFile", debug_log_.string());
    SetSetting(kSettingsAddIn, "SuppressTimeStamps", "true");
    SetSetting(kSettingsAddIn, "ProjectPause", 0);
    for (const Language& language : languages) {
      SetSetting(language.name, "Active", language.active ? 1 : 0);
      SetSetting(language.name, "LanguageAddIn", 1);
      SetSetting(language.name, "ServerProgId", language.server_prog_id);
      SetSetting(language.name, "RteText", "round trip");
      SetSetting(language.name, "IsRTEAddIn", "Yes");
    }
    app_ = host::modeltool::Application::Create();
    host::modeltool::LoadAddInsFromRegistry(
        *app_->AddIns(), (directory_ / "settings.json").string());
    model_ = host::modeltool::Model::Create(
        host::modeltool::SequentialUniqueIds("ID"));
    app_->SetCurrentModel(model_);
    model_->SaveAs(ModelPath());
    WriteFile(debug_log_, "");
  }

  ~UpdateScene() {
    platform::UseRegistryStore(platform::RegistryStore());
    std::filesystem::remove_all(directory_);
  }

  UpdateScene(const UpdateScene&) = delete;
  UpdateScene& operator=(const UpdateScene&) = delete;

  // A value under an add-in's key, in force at once.
  void SetSetting(const std::string& add_in, const std::string& name,
                  const std::string& text) {
    registry_.SetString(platform::kHkeyLocalMachine, KeyOf(add_in), name, text);
    platform::UseRegistryStore(registry_);
  }
  void SetSetting(const std::string& add_in, const std::string& name,
                  uint32_t number) {
    registry_.SetDword(platform::kHkeyLocalMachine, KeyOf(add_in), name,
                       number);
    platform::UseRegistryStore(registry_);
  }
  void RemoveSetting(const std::string& add_in, const std::string& name) {
    registry_.RemoveValue(platform::kHkeyLocalMachine, KeyOf(add_in), name);
    platform::UseRegistryStore(registry_);
  }

  // A component of `language` whose code is described in "<name>.json",
  // and the code itself (JSON text).
  std::shared_ptr<host::modeltool::Component> AddComponent(
      const std::string& name, const std::string& language) {
    auto component = model_->RootComponentPackage()->NewComponent(name);
    component->SetLanguage(language);
    component->OverrideToolProperty(language, "ProjectFile", name + ".json");
    return component;
  }
  void WriteCode(const std::string& component, const std::string& json) const {
    WriteFile(directory_ / (component + ".json"), json);
  }

  std::shared_ptr<host::modeltool::Class> ModelClass(
      const std::string& name) const {
    for (const auto& cls : model_->Classes()) {
      if (cls->Name() == name) return cls;
    }
    return nullptr;
  }

  // The debug log's lines since the scene was made or last read.
  Lines TakeDebugLines() const {
    std::stringstream text(ReadFile(debug_log_));
    WriteFile(debug_log_, "");
    Lines lines;
    for (std::string line; std::getline(text, line);) {
      if (!line.empty() && line.back() == '\r') line.pop_back();
      lines.push_back(line);
    }
    return lines;
  }

  std::string ModelPath() const { return (directory_ / "model.json").string(); }
  const std::filesystem::path& Directory() const { return directory_; }
  const std::shared_ptr<host::modeltool::Application>& App() const {
    return app_;
  }
  const std::shared_ptr<host::modeltool::Model>& Model() const {
    return model_;
  }

 private:
  static std::string KeyOf(const std::string& add_in) {
    return std::string(host::modeltool::kAddInsKey) + "\\" + add_in;
  }

  std::filesystem::path directory_;
  std::filesystem::path debug_log_;
  platform::RegistryStore registry_;
  std::shared_ptr<host::modeltool::Application> app_;
  std::shared_ptr<host::modeltool::Model> model_;
};

}  // namespace testing_support

#endif  // KELQLN_TESTS_SUPPORT_UPDATE_SCENE_H_
