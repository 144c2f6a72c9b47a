// The world the selection tests run in: a model of the modelling tool with
// its application, the add-ins "VisualStudio", "VC++" and "VB" described in
// a test registry, each served by a small language server made by
// programmatic identifier, and a debug log written to a file of the test.
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

// A statement generator that includes every element except those named
// "Refused...", and keeps the arguments of each query.
class TestGenerator : public automation::DispatchImpl<TestGenerator> {
 public:
  static const automation::MemberTable<TestGenerator>& Members() {
    static const automation::MemberTable<TestGenerator> table(
        "TestGenerator",
        {{external::code_view::statement_generator::kProcess,
          external::code_view::statement_generator::kProcessName,
          CallKind::kMethod, [](TestGenerator& self, Args& args) {
            self.queries.push_back(args);
            return Variant(
                !automation::CStr(
                     automation::Get(automation::CObj(args.at(1)), 100))
                     .starts_with("Refused"));
          }}});
    return table;
  }

  std::vector<Args> queries;
};

// A language add-in's server: its own round-trip server, with a statement
// generator (none when `generator` is null) and, for "VC++", the
// component-properties service giving every component `project_file`.
class TestLanguageServer : public automation::DispatchImpl<TestLanguageServer> {
 public:
  static const automation::MemberTable<TestLanguageServer>& Members() {
    using Self = TestLanguageServer;
    namespace rte = external::code_view::rte_server;
    static const automation::MemberTable<Self> table(
        "TestLanguageServer",
        {{automation::kNamedOnly, rte::kStatementGenerator, CallKind::kMethod,
          [](Self& self, Args&) {
            ++self.generator_reads;
            return Variant(self.generator);
          }},
         {automation::kNamedOnly,
          external::code_view::add_in_server::kCompPropertiesApi,
          CallKind::kMethod,
          [](Self& self, Args&) { return Variant(self.shared_from_this()); }},
         {automation::kNamedOnly,
          external::code_view::comp_properties::kProjectFile, CallKind::kMethod,
          [](Self& self, Args&) { return Variant(self.project_file); }},
         {automation::kNamedOnly, rte::kCodeViewProject, CallKind::kMethod,
          [](Self& self, Args& args) {
            return Variant(self.code_view_project(
                automation::CObj(args.at(0)), automation::CObj(args.at(1))));
          }}});
    return table;
  }

  std::shared_ptr<TestGenerator> generator = std::make_shared<TestGenerator>();
  int generator_reads = 0;
  std::string project_file;
  std::function<Object(const Object& component, const Object& reporter)>
      code_view_project;
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
    for (const auto& [name, server] : servers_) {
      automation::UnregisterClass("kelqln.test." + name);
    }
    platform::UseRegistryStore(platform::RegistryStore());
    ResetDebugSettings();
    std::filesystem::remove_all(directory_);
  }

  // Describes the add-ins in the registry and installs them.
  void Install() {
    const auto hklm = platform::kHkeyLocalMachine;
    int n = 0;
    for (const char* name : {"VisualStudio", "VC++", "VB"}) {
      store_.SetString(hklm, kAddInsKey, std::to_string(++n), name);
      std::string prog_id = std::string("kelqln.test.") + name;
      store_.SetString(hklm, std::string(kAddInsKey) + "\\" + name,
                       "ServerProgId", prog_id);
      auto server = std::make_shared<TestLanguageServer>();
      servers_[name] = server;
      automation::RegisterClass(prog_id, "", [server] { return server; });
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

  TestLanguageServer& Server(const std::string& name) {
    return *servers_.at(name);
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
  std::map<std::string, std::shared_ptr<TestLanguageServer>> servers_;
  platform::RegistryStore store_;
};

}  // namespace kelqln::testing

#endif  // KELQLN_TESTS_SELECTION_SELECTION_TEST_SUPPORT_H_
