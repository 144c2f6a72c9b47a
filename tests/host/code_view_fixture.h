// What the code-view tests share: a modelling tool with the description
// add-in installed from the registry as "VC++" and "Visual Basic", a saved
// model with the component App whose code is `app.json` beside the model
// file, a reporter that records its lines, and the system's run of an
// update (open, project update, component updates) through late-bound
// members only. The reporter is a recording double.
#ifndef KELQLN_TESTS_HOST_CODE_VIEW_FIXTURE_H_
#define KELQLN_TESTS_HOST_CODE_VIEW_FIXTURE_H_

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <nlohmann/json.hpp>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/collection.h"
#include "automation/member_table.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "host/codeview/registration.h"
#include "host/modeltool/add_in_manager.h"
#include "host/modeltool/add_in_registry.h"
#include "platform/registry.h"
#include "platform/registry_store.h"
#include "sample_model.h"
#include "tests/support/recording_object.h"

namespace host::codeview {

namespace cv = external::code_view;
namespace orel = external::orel;
namespace fs = std::filesystem;
using automation::CallByName;
using automation::CStr;
using automation::Object;
using automation::Variant;
using Json = nlohmann::json;
using Lines = std::vector<std::string>;

// The code of App as the tests start from: shapes.h with Shape, IDrawable
// and Circle; canvas.h with Canvas. Canvas and Shape are the two ends of the
// association "holds".
inline Json BaseDescription() {
  return Json::parse(R"({
    "format": "kelqln-code-description", "version": 1, "name": "Shapes",
    "components": [
      {"name": "shapes.h", "classes": [
        {"name": "Shape",
         "attributes": [{"name": "x", "type": "int", "visibility": "private"},
                        {"name": "y", "type": "int"}],
         "operations": [
           {"name": "Draw", "returnType": "void",
            "parameters": [{"name": "context", "type": "Context&"}]},
           {"name": "Area", "returnType": "double"}],
         "roles": [{"name": "canvas", "class": "Canvas",
                    "association": "holds"}]},
        {"name": "IDrawable", "stereotype": "interface",
         "operations": [{"name": "Draw", "returnType": "void"}]},
        {"name": "Circle", "bases": ["Shape"], "realizes": ["IDrawable"],
         "attributes": [{"name": "radius", "type": "double"}]}]},
      {"name": "canvas.h", "classes": [
        {"name": "Canvas",
         "has": [{"name": "background", "class": "Shape"}],
         "roles": [{"name": "items", "class": "Shape", "association": "holds",
                    "cardinality": "0..*", "aggregate": true}]}]}]})");
}

// `j`'s class `name`.
inline Json& ClassIn(Json& j, const std::string& name) {
  for (auto& component : j["components"]) {
    for (auto& cls : component["classes"]) {
      if (cls["name"] == name) return cls;
    }
  }
  throw std::runtime_error("no class " + name);
}

// The objects of a collection, in order.
inline std::vector<Object> Items(const Object& collection) {
  std::vector<Object> items;
  for (const Variant& item : automation::CollectionItems(collection)) {
    items.push_back(automation::CObj(item));
  }
  return items;
}

// What a collector holds, in words: "Circle" for a class, "Shape: Attribute
// y" for a member, read through the tool's members.
inline std::multiset<std::string> Vanished(const Object& collector) {
  std::multiset<std::string> found;
  auto name = [](const Object& e) {
    return CStr(automation::Get(e, orel::element::kName));
  };
  for (const Object& cls : Items(
           automation::GetObject(collector, cv::collector::kVanishedClasses))) {
    found.insert(name(cls));
  }
  for (const Object& entry : Items(
           automation::GetObject(collector, cv::collector::kVanishedMembers))) {
    Object owner = automation::GetObject(entry, cv::collector_entry::kClass);
    for (const Object& member :
         Items(automation::GetObject(entry, cv::collector_entry::kMembers))) {
      found.insert(name(owner) + ": " +
                   CStr(automation::Get(member, orel::element::kKindName)) +
                   " " + name(member));
    }
  }
  return found;
}

class CodeViewTest : public ::testing::Test {
 protected:
  void SetUp() override {
    RegisterCodeViewClasses();
    directory_ =
        fs::temp_directory_path() /
        ("kelqln-codeview-" + std::to_string(::getpid()) + "-" +
         ::testing::UnitTest::GetInstance()->current_test_info()->name());
    fs::remove_all(directory_);
    fs::create_directories(directory_);
    auto hklm = platform::kHkeyLocalMachine;
    int n = 0;
    for (const char* name : {"VC++", "Visual Basic"}) {
      registry_.SetString(hklm, modeltool::kAddInsKey, std::to_string(++n),
                          name);
      std::string key = KeyOf(name);
      registry_.SetDword(hklm, key, "LanguageAddIn", 1);
      registry_.SetString(hklm, key, "ServerProgId", kDescriptionProgId);
      registry_.SetString(hklm, key, "RteText", "round trip");
      registry_.SetString(hklm, key, "IsRTEAddIn", "Yes");
    }
    platform::UseRegistryStore(registry_);

    app_ = modeltool::Application::Create();
    modeltool::LoadAddInsFromRegistry(*app_->AddIns(),
                                      (directory_ / "settings.json").string());
    NewModel();
    reporter_ = testing_support::RecordingObject::Create();
  }

  // A new current model, saved beside the code, holding only the component.
  void NewModel() {
    model_ = modeltool::Model::Create(modeltool::SequentialUniqueIds("ID"));
    app_->SetCurrentModel(model_);
    component_ = model_->RootComponentPackage()->NewComponent("App");
    component_->SetLanguage("VC++");
    component_->OverrideToolProperty("VC++", "ProjectFile", "app.json");
    model_->SaveAs(ModelPath());
  }

  void TearDown() override {
    platform::UseRegistryStore(platform::RegistryStore());
    fs::remove_all(directory_);
  }

  static std::string KeyOf(const std::string& add_in) {
    return std::string(modeltool::kAddInsKey) + "\\" + add_in;
  }
  // Changes a value of an add-in's key at once.
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

  std::string ModelPath() const { return (directory_ / "model.json").string(); }
  std::string CodePath() const { return (directory_ / "app.json").string(); }
  void WriteCode(const Json& code) const {
    WriteFile(CodePath(), code.dump(1));
  }
  static void WriteFile(const std::string& path, const std::string& text) {
    std::ofstream(path, std::ios::binary) << text;
  }
  static std::string ReadFile(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    std::stringstream text;
    text << in.rdbuf();
    return text.str();
  }

  // The round-trip server of an add-in, as the system reaches it.
  Object Server(const std::string& add_in) const {
    Object server = automation::GetObject(app_->AddIns()->Find(add_in),
                                          orel::add_in::kServer);
    return automation::CObj(
        CallByName(server, cv::add_in_server::kGetRteServer));
  }
  Object Project() const {
    return automation::CObj(CallByName(Server("VC++"),
                                       cv::rte_server::kCodeViewProject,
                                       Object(component_), Object(reporter_)));
  }
  Object NewCollector() const {
    return automation::CreateObject(cv::collector::kProgId);
  }

  // The system's update of one project: open, the project's update, then
  // the update of each code-view component given (all when none is).
  Object Update(const Object& project,
                const std::vector<std::string>& only = {}) const {
    automation::Call(project, cv::project::kOpen, Object(reporter_));
    Object collector = NewCollector();
    automation::Call(project, cv::project::kUpdateModel, Object(model_),
                     Object(reporter_), collector, false);
    for (const Object& component :
         Items(automation::GetObject(project, cv::project::kComponents))) {
      std::string name = CStr(automation::Get(component, cv::component::kName));
      if (!only.empty() &&
          std::find(only.begin(), only.end(), name) == only.end()) {
        continue;
      }
      automation::Call(component, cv::component::kUpdateModel, Object(model_),
                       Object(reporter_), collector, true);
    }
    return collector;
  }

  // The texts the code view reported through `operation` ("Log",
  // "Warning", "Error"), in order.
  Lines Reported(const char* operation) const {
    Lines lines;
    for (const auto& call : reporter_->CallsTo(operation)) {
      lines.push_back(CStr(call.args.at(0)));
    }
    return lines;
  }
  Lines Logs() const { return Reported("Log"); }
  Lines Warnings() const { return Reported("Warning"); }
  Lines Errors() const { return Reported("Error"); }
  // Every line, for the message of a failed expectation.
  std::string Report() const {
    std::string text;
    for (const char* operation : {"Log", "Warning", "Error"}) {
      for (const std::string& line : Reported(operation)) {
        text += std::string(operation) + ": " + line + "\n";
      }
    }
    return text;
  }

  std::shared_ptr<modeltool::Class> ModelClass(const std::string& name) const {
    for (const auto& cls : model_->Classes()) {
      if (cls->Name() == name) return cls;
    }
    return nullptr;
  }

  fs::path directory_;
  platform::RegistryStore registry_;
  std::shared_ptr<modeltool::Application> app_;
  std::shared_ptr<modeltool::Model> model_;
  std::shared_ptr<modeltool::Component> component_;
  std::shared_ptr<testing_support::RecordingObject> reporter_;
};

}  // namespace host::codeview

#endif  // KELQLN_TESTS_HOST_CODE_VIEW_FIXTURE_H_
