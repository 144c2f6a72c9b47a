#include "engine/model_update_engine_utilities.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <functional>
#include <memory>
#include <sstream>
#include <string>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/error.h"
#include "entry/debug_log.h"
#include "entry/run_globals.h"
#include "external/code_view.h"
#include "external/common_dialog.h"
#include "external/orel.h"
#include "external/string_service.h"
#include "host/dialogs/common_dialog.h"
#include "host/modeltool/add_in.h"
#include "host/modeltool/add_in_manager.h"
#include "host/modeltool/application.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/model.h"
#include "host/strings/string_service.h"
#include "platform/registry.h"
#include "platform/registry_store.h"
#include "reporting/reporter_api_dispatch.h"
#include "reporting/shared_simplereporter.h"
#include "tests/support/error_of.h"
#include "tests/support/recording_object.h"

namespace kelqln {
namespace {

namespace fs = std::filesystem;
namespace modeltool = host::modeltool;
namespace rte = external::code_view::rte_server;
using automation::Args;
using automation::CallKind;
using automation::DispId;
using automation::Object;
using automation::Variant;
using testing_support::ErrorOf;
using testing_support::RecordingObject;

const std::string kAddInsKey = modeltool::kAddInsKey;

std::string FileText(const fs::path& path) {
  std::ifstream in(path, std::ios::binary);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

class EngineUtilitiesTest : public ::testing::Test {
 protected:
  void SetUp() override {
    directory_ = fs::temp_directory_path() /
                 ("kelqln-engine-utilities-" + std::to_string(::getpid()));
    fs::remove_all(directory_);
    fs::create_directories(directory_);
    // The debug log of this library, without time stamps, into the test's
    // directory.
    auto hklm = platform::kHkeyLocalMachine;
    std::string settings = kAddInsKey + "\\VisualStudio";
    registry_.SetDword(
        hklm, settings, "Debug",
        (1u << kDebugCategoryQln) | (1u << (24 + kDebugLevelError)));
    registry_.SetString(hklm, settings, "DebugOutputFile",
                        (directory_ / "debug.txt").string());
    registry_.SetString(hklm, settings, "SuppressTimeStamps", "true");
    platform::UseRegistryStore(registry_);
    ResetDebugSettings();

    app_->SetCurrentModel(model_);
    app_->SetMainWindow(4242);
    SetOrelApp(app_);
    host::strings::RegisterStringService();
    SetStringRes(automation::CreateObject(external::string_service::kProgId));
    host::dialogs::RegisterCommonDialog();
    host::dialogs::ResetSaveDialogs();
  }

  void TearDown() override {
    ResetRunGlobals();
    host::dialogs::ResetSaveDialogs();
    automation::UnregisterClass(external::common_dialog::kProgId);
    platform::UseRegistryStore(platform::RegistryStore());
    ResetDebugSettings();
    fs::remove_all(directory_);
  }

  // Installs an add-in of the tool with `server`; a round-trip language
  // add-in unless `round_trip` is false.
  void Install(const std::string& name, Object server, bool round_trip = true) {
    modeltool::AddInDescription description;
    description.name = name;
    description.language_add_in = true;
    description.rte_text = name + " round trip";
    auto add_in = std::make_shared<modeltool::AddIn>(description);
    add_in->SetServer(std::move(server));
    app_->AddIns()->Add(add_in);
    if (round_trip) {
      registry_.SetString(platform::kHkeyLocalMachine, kAddInsKey + "\\" + name,
                          "IsRTEAddIn", "Yes");
    }
    platform::UseRegistryStore(registry_);
  }

  std::string DebugLogText() const {
    return FileText(directory_ / "debug.txt");
  }

  fs::path directory_;
  platform::RegistryStore registry_;
  std::shared_ptr<modeltool::Application> app_ =
      modeltool::Application::Create();
  std::shared_ptr<modeltool::Model> model_ = modeltool::Model::Create();
};

TEST_F(EngineUtilitiesTest, TheAddInCacheIsBuiltOnceAndNotRefreshed) {
  auto basic = RecordingObject::Create();
  Install("Basic", basic);
  Install("Notes", RecordingObject::Create(), /*round_trip=*/false);

  EXPECT_EQ(GetLanguageAddIn("Basic"), Object(basic));
  auto late = RecordingObject::Create();
  Install("Pascal", late);
  // Not a round-trip add-in, and one installed after the walk: both miss,
  // on every call, and neither gets into the cache.
  for (int call = 0; call < 2; ++call) {
    EXPECT_EQ(ErrorOf([] { GetLanguageAddIn("Notes"); }),
              automation::kInvalidProcedureCall);
    EXPECT_EQ(ErrorOf([] { GetLanguageAddIn("Pascal"); }),
              automation::kInvalidProcedureCall);
  }
  EXPECT_EQ(GetAddInHandlers()->Count(), 1);

  SetAddInHandlers(nullptr);  // what the entry object's teardown does
  EXPECT_EQ(GetLanguageAddIn("Pascal"), Object(late));
}

TEST_F(EngineUtilitiesTest, AFailedWalkLeavesNoCacheBehind) {
  auto basic = RecordingObject::Create();
  Install("Basic", basic);
  SetOrelApp(RecordingObject::Create([](DispId id, CallKind, Args&) -> Variant {
    throw automation::Error(automation::kNoSuchMember);
  }));
  EXPECT_EQ(ErrorOf([] { GetLanguageAddIn("Basic"); }),
            automation::kNoSuchMember);
  EXPECT_EQ(GetAddInHandlers(), nullptr);

  SetOrelApp(app_);
  EXPECT_EQ(GetLanguageAddIn("Basic"), Object(basic));
}

TEST_F(EngineUtilitiesTest, CodeViewProjectCopiesBackComponentAndReporter) {
  auto project = RecordingObject::Create();
  auto other_component = RecordingObject::Create();
  auto other_reporter = shared_simplereporter::Create();
  Variant handed_back;  // what the server puts in the reporter argument
  auto server = RecordingObject::Create();
  server->responder = [&](DispId id, CallKind, Args& args) -> Variant {
    if (id != server->IdOfName(rte::kCodeViewProject)) return {};
    args.at(0) = Variant(Object(other_component));
    args.at(1) = handed_back;
    return Object(project);
  };
  Install("Basic", server);

  struct Case {
    const char* name;
    Variant handed_back;
    bool found;
  };
  for (const Case& test :
       {Case{"replaced", Variant(Object(other_reporter)), true},
        Case{"not a reporter", Variant(Object(RecordingObject::Create())),
             false}}) {
    SCOPED_TRACE(test.name);
    handed_back = test.handed_back;
    auto first_component = RecordingObject::Create();
    Object component = first_component;
    std::shared_ptr<kelReporterApi> original = shared_simplereporter::Create();
    std::shared_ptr<kelReporterApi> reporter = original;

    Object found = GetCodeViewProject(app_, "Basic", component, reporter);

    const auto& call = server->calls.back();
    EXPECT_EQ(automation::CObj(call.args.at(0)), Object(first_component));
    if (test.found) {
      EXPECT_EQ(found, Object(project));
      EXPECT_EQ(component, Object(other_component));
      EXPECT_EQ(reporter, ReporterOf(test.handed_back));
    } else {
      // Nothing is copied back from a call that failed.
      EXPECT_EQ(found, nullptr);
      EXPECT_EQ(component, Object(first_component));
      EXPECT_EQ(reporter, original);
    }
  }
}

TEST_F(EngineUtilitiesTest, CodeViewProjectOfAMissingAddInIsLoggedAsNothing) {
  Object component = RecordingObject::Create();
  std::shared_ptr<kelReporterApi> reporter = shared_simplereporter::Create();
  EXPECT_EQ(GetCodeViewProject(app_, "Cobol", component, reporter), nullptr);
  EXPECT_NE(DebugLogText().find("ERROR kelQLN.GetCodeViewProject(Cobol): "),
            std::string::npos);
}

TEST_F(EngineUtilitiesTest, StatementGeneratorAnswersForTheComponentsLanguage) {
  Variant answer;
  auto generator =
      RecordingObject::Create([&](DispId id, CallKind, Args& args) -> Variant {
        if (id != external::code_view::statement_generator::kProcess) return {};
        args.at(4) = answer;
        return answer;
      });
  auto server = RecordingObject::Create();
  server->responder = [&](DispId id, CallKind, Args&) -> Variant {
    if (id == server->IdOfName(rte::kStatementGenerator))
      return Object(generator);
    throw automation::Error(automation::kNoSuchMember);
  };
  Install("Basic", server);
  auto basic = model_->RootComponentPackage()->NewComponent("Forms");
  basic->SetLanguage("Basic");
  auto other = model_->RootComponentPackage()->NewComponent("Core");
  other->SetLanguage("Cobol");

  struct Case {
    const char* name;
    Object element;
    Variant answer;
    bool included;
  };
  for (const Case& test :
       {Case{"yes", basic, Variant(true), true},
        Case{"non-zero", basic, Variant(int32_t{2}), true},
        Case{"no", basic, Variant(false), false},
        Case{"failing generator", basic, Variant("maybe"), false},
        Case{"no add-in", other, Variant(true), false}}) {
    SCOPED_TRACE(test.name);
    answer = test.answer;
    Object element = test.element;
    EXPECT_EQ(QueryStatementGenerator(element), test.included);
    EXPECT_EQ(element, test.element);
  }
  // (element, the element as an item, mode 0, no reporter, answer)
  const Args& query = generator->calls.front().args;
  ASSERT_EQ(query.size(), 5u);
  EXPECT_EQ(automation::CObj(query[1]), Object(basic));
  EXPECT_TRUE(query[3].IsNothing());
}

TEST_F(EngineUtilitiesTest, SaveModelSavesInPlaceOrUnderTheChosenName) {
  struct Case {
    const char* name;
    bool saved_before;
    std::vector<std::string> answers;
    bool dialog_component;
    bool saved_under_answer;
  };
  const fs::path chosen = directory_ / "chosen.json";
  const fs::path kept = directory_ / "kept.json";
  const std::vector<Case> cases = {
      {"in place", true, {}, true, false},
      {"chosen name", false, {chosen.string()}, true, true},
      {"cancelled", false, {}, true, false},
      {"blank name", false, {"   "}, true, false},
      {"no dialog component", false, {chosen.string()}, false, false},
  };
  for (const Case& test : cases) {
    SCOPED_TRACE(test.name);
    auto model = modeltool::Model::Create();
    app_->SetCurrentModel(model);
    app_->SetSaveDialogPending(false);
    fs::remove(chosen);
    fs::remove(kept);
    if (test.saved_before) {
      model->SaveAs(kept.string());
      fs::remove(kept);
    }
    host::dialogs::ResetSaveDialogs();
    host::dialogs::PresetSaveAnswers(test.answers);
    if (!test.dialog_component) {
      automation::UnregisterClass(external::common_dialog::kProgId);
    }

    SaveModel(app_);
    host::dialogs::RegisterCommonDialog();

    EXPECT_EQ(fs::exists(kept), test.saved_before);
    EXPECT_EQ(fs::exists(chosen), test.saved_under_answer);
    EXPECT_EQ(model->FilePath(), test.saved_before         ? kept.string()
                                 : test.saved_under_answer ? chosen.string()
                                                           : "");
    // Only a model never saved asks for a name.
    EXPECT_EQ(app_->SaveDialogPending(), !test.saved_before);
    auto shown = host::dialogs::ShownSaveDialogs();
    ASSERT_EQ(shown.size(),
              !test.saved_before && test.dialog_component ? 1u : 0u);
    if (!shown.empty()) {
      EXPECT_EQ(shown[0].title, StringResText(31000));
      EXPECT_EQ(shown[0].filter, StringResText(31001));
      EXPECT_EQ(automation::CLng(shown[0].parent_window), 4242);
      EXPECT_EQ(shown[0].file_name, "");
    }
  }
}

TEST_F(EngineUtilitiesTest, SaveDialogIsGivenOnlyWhatTheCallerHas) {
  auto dialog = RecordingObject::Create();
  automation::RegisterClass(external::common_dialog::kProgId, "",
                            [&] { return dialog; });
  namespace names = external::common_dialog;
  auto puts = [&] {
    std::vector<DispId> ids;
    for (const auto& call : dialog->calls) {
      if (call.kind == CallKind::kPropertyPut) ids.push_back(call.id);
    }
    return ids;
  };

  std::string file_name;
  ShowSaveDialog(file_name, "All|*.*");
  EXPECT_EQ(puts(), std::vector<DispId>{dialog->IdOfName(names::kFilter)});

  dialog->calls.clear();
  file_name = "start.json";
  ShowSaveDialog(file_name, "All|*.*", "Title", int32_t{9});
  EXPECT_EQ(puts(), (std::vector<DispId>{dialog->IdOfName(names::kDialogTitle),
                                         dialog->IdOfName(names::kParentWindow),
                                         dialog->IdOfName(names::kFileName),
                                         dialog->IdOfName(names::kFilter)}));
  EXPECT_EQ(dialog->CallsTo(names::kShowSave).size(), 1u);

  automation::UnregisterClass(names::kProgId);
  file_name = "unchanged.json";
  ShowSaveDialog(file_name, "All|*.*");
  EXPECT_EQ(file_name, "unchanged.json");
}

}  // namespace
}  // namespace kelqln
