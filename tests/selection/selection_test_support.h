// The world the selection tests run in: a model of the modelling tool with
// its application, the add-ins "VisualStudio", "VC++" and "Visual Basic"
// described in a test registry and served by the description add-in (or, to
// see what the selection asks, by a small observing server), code
// descriptions in files of the test, and a debug log written to another.
#ifndef KELQLN_TESTS_SELECTION_SELECTION_TEST_SUPPORT_H_
#define KELQLN_TESTS_SELECTION_SELECTION_TEST_SUPPORT_H_

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <functional>
#include <map>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/member_table.h"
#include "entry/debug_log.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "host/codeview/registration.h"
#include "host/modeltool/add_in_manager.h"
#include "host/modeltool/add_in_registry.h"
#include "host/modeltool/application.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"
#include "platform/registry.h"
#include "platform/registry_store.h"

namespace kelqln::testing {

using automation::Args;
using automation::CallKind;
using automation::Object;
using automation::Variant;

// A statement generator that includes every element and keeps the
// arguments of each query, for the tests that look at what the selection
// asks.
class ObservedGenerator : public automation::DispatchImpl<ObservedGenerator> {
 public:
  static const automation::MemberTable<ObservedGenerator>& Members() {
    static const automation::MemberTable<ObservedGenerator> table(
        "ObservedGenerator",
        {{external::code_view::statement_generator::kProcess,
          external::code_view::statement_generator::kProcessName,
          CallKind::kMethod, [](ObservedGenerator& self, Args& args) {
            self.queries.push_back(args);
            return Variant(true);
          }}});
    return table;
  }
  std::vector<Args> queries;
};

// A language add-in's server that is its own round-trip server and counts
// how often its statement generator is read.
class ObservedServer : public automation::DispatchImpl<ObservedServer> {
 public:
  static const automation::MemberTable<ObservedServer>& Members() {
    static const automation::MemberTable<ObservedServer> table(
        "ObservedServer",
        {{automation::kNamedOnly,
          external::code_view::rte_server::kStatementGenerator,
          CallKind::kMethod, [](ObservedServer& self, Args&) {
            ++self.generator_reads;
            return Variant(self.generator);
          }}});
    return table;
  }
  std::shared_ptr<ObservedGenerator> generator =
      std::make_shared<ObservedGenerator>();
  int generator_reads = 0;
};

inline constexpr char kAddInsKey[] = "SOFTWARE\\Quenta Software\\Orel\\AddIns";
inline const std::string kSettingsKey =
    std::string(kAddInsKey) + "\\VisualStudio";

class SelectionTest : public ::testing::Test {
 protected:
  void SetUp() override {
    directory_ =
        std::filesystem::path(::testing::TempDir()) /
        ("kelqln_selection_" +
         std::string(
             ::testing::UnitTest::GetInstance()->current_test_info()->name()));
    std::filesystem::remove_all(directory_);
    std::filesystem::create_directories(directory_);
    model_->SetName("Model");
    app_->SetCurrentModel(model_);
    Install();
  }

  void TearDown() override {
    for (const auto& [name, server] : observed_) {
      automation::UnregisterClass("kelqln.test." + name);
    }
    platform::UseRegistryStore(platform::RegistryStore());
    ResetDebugSettings();
    std::filesystem::remove_all(directory_);
  }

  // Installs the add-ins "VisualStudio", "VC++" and "Visual Basic": the
  // description add-in, which refuses elements of stereotype "Refused",
  // except those named in `observed_`, served by an ObservedServer.
  void Install() {
    host::codeview::RegisterCodeViewClasses();
    const auto hklm = platform::kHkeyLocalMachine;
    int n = 0;
    for (const char* name : {"VisualStudio", "VC++", "Visual Basic"}) {
      store_.SetString(hklm, kAddInsKey, std::to_string(++n), name);
      std::string key = std::string(kAddInsKey) + "\\" + name;
      std::string prog_id = host::codeview::kDescriptionProgId;
      if (observed_.count(name)) {
        auto server = std::make_shared<ObservedServer>();
        observed_[name] = server;
        prog_id = std::string("kelqln.test.") + name;
        automation::RegisterClass(prog_id, "", [server] { return server; });
      }
      store_.SetString(hklm, key, "ServerProgId", prog_id);
      store_.SetString(hklm, key, "RefusedStereotypes", "Refused");
    }
    // Categories 2 and 5 at every level, without time stamps.
    store_.SetDword(hklm, kSettingsKey, "Debug", 0x7f000024);
    store_.SetString(hklm, kSettingsKey, "DebugOutputFile", LogPath());
    store_.SetString(hklm, kSettingsKey, "SuppressTimeStamps", "true");
    EditRegistry([](platform::RegistryStore&) {});
    host::modeltool::LoadAddInsFromRegistry(
        *app_->AddIns(), (directory_ / "settings.json").string());
  }

  // Changes values of the registry the add-ins and the debug log read.
  void EditRegistry(const std::function<void(platform::RegistryStore&)>& edit) {
    edit(store_);
    platform::UseRegistryStore(store_);
    ResetDebugSettings();
  }

  std::string LogPath() const { return (directory_ / "debug.log").string(); }

  // The debug log's messages, without the level and category columns.
  std::vector<std::string> LogMessages() const {
    std::ifstream file(LogPath(), std::ios::binary);
    std::stringstream text;
    text << file.rdbuf();
    // Each line: blank, level and category padded to 8 with a blank
    // between, two blanks, the message, CR LF. A message may hold CR LF TAB.
    constexpr size_t kColumns = 20;
    std::vector<std::string> messages;
    std::string all = text.str();
    for (size_t at = 0; at + kColumns < all.size();) {
      size_t end = all.find("\r\n ", at);
      if (end == std::string::npos) end = all.size() - 2;
      messages.push_back(all.substr(at + kColumns, end - at - kColumns));
      at = end + 2;
    }
    return messages;
  }

  // Sets a value under an add-in's key.
  void SetAddInValue(const std::string& add_in, const std::string& name,
                     const std::string& text) {
    EditRegistry([&](platform::RegistryStore& store) {
      store.SetString(platform::kHkeyLocalMachine,
                      std::string(kAddInsKey) + "\\" + add_in, name, text);
    });
  }

  // A component of `language` whose code, for the description add-in
  // `add_in` (by default its language's), is a project named `name` with
  // the code-view components `components` and, unless null, the unique
  // identifier `id`.
  std::shared_ptr<host::modeltool::Component> ComponentWithCode(
      const std::string& name, const std::string& language,
      const std::vector<std::string>& components, const char* id = nullptr,
      std::string add_in = "") {
    if (add_in.empty()) add_in = language;
    auto component = NewComponent(name, language);
    std::string file = (directory_ / (name + ".json")).string();
    component->OverrideToolProperty(add_in, "ProjectFile", file);
    std::string text =
        R"({"format": "kelqln-code-description", "version": 1, "name": ")" +
        name + "\"" + (id ? std::string(R"(, "id": ")") + id + "\"" : "") +
        R"(, "components": [)";
    for (const auto& part : components) {
      text += std::string(text.back() == '[' ? "" : ",") + R"({"name": ")" +
              part + "\"}";
    }
    std::ofstream(file) << text << "]}";
    return component;
  }

  // The code-view project of `component` from the add-in `add_in`.
  Object CodeViewProjectOf(const Object& component, const std::string& add_in) {
    Object server = automation::GetObject(app_->AddIns()->Find(add_in),
                                          external::orel::add_in::kServer);
    return automation::CObj(automation::CallByName(
        automation::CObj(automation::CallByName(
            server, external::code_view::add_in_server::kGetRteServer)),
        external::code_view::rte_server::kCodeViewProject, component,
        Object()));
  }

  std::shared_ptr<host::modeltool::Component> NewComponent(
      const std::string& name, const std::string& language,
      const std::string& stereotype = "") {
    auto component = model_->RootComponentPackage()->NewComponent(name);
    component->SetLanguage(language);
    component->SetStereotype(stereotype);
    return component;
  }

  std::shared_ptr<host::modeltool::Class> NewClass(
      const std::string& name,
      std::vector<std::shared_ptr<host::modeltool::Component>> components = {},
      const std::string& stereotype = "") {
    auto cls = model_->RootLogicalPackage()->NewClass(name);
    cls->SetStereotype(stereotype);
    for (const auto& component : components) cls->AssignTo(component);
    return cls;
  }

  std::filesystem::path directory_;
  std::shared_ptr<host::modeltool::Application> app_ =
      host::modeltool::Application::Create();
  std::shared_ptr<host::modeltool::Model> model_ =
      host::modeltool::Model::Create(
          host::modeltool::SequentialUniqueIds("ID"));
  // Set before SetUp: the add-ins to serve by an ObservedServer.
  std::map<std::string, std::shared_ptr<ObservedServer>> observed_;
  platform::RegistryStore store_;
};

}  // namespace kelqln::testing

#endif  // KELQLN_TESTS_SELECTION_SELECTION_TEST_SUPPORT_H_
