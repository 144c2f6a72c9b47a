// The engine on selections that only the wizard makes: project entries
// whose code-view project is still to be found. A silent Start never files
// such entries (tests/entry/library_test.cc covers that road).
#include "engine/kel_model_update_engine.h"

#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "automation/class_registry.h"
#include "automation/collection.h"
#include "entry/debug_log.h"
#include "entry/run_globals.h"
#include "external/code_view.h"
#include "external/string_service.h"
#include "platform/manual_clock.h"
#include "reporting/api_progress.h"
#include "selection/kel_sorted_cv_project.h"
#include "selection/kel_sorted_cv_projects.h"
#include "tests/support/recording_object.h"
#include "tests/support/update_scene.h"

namespace kelqln {
namespace {

using testing_support::Lines;
using testing_support::TextsOf;
using testing_support::UpdateScene;

constexpr char kTotals[] =
    "The update finished with 0 error(s) and 0 warning(s).";
constexpr char kCode[] = R"({"format": "kelqln-code-description",
  "version": 1, "components": [{"name": "unit", "classes": [{"name": "A"}]}]})";

class EngineTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ResetDebugSettings();
    SetStringRes(automation::CreateObject(external::string_service::kProgId));
    SetOrelApp(scene_.App());
    platform::SetClock(clock_);
  }
  void TearDown() override {
    platform::SetClock(nullptr);
    ResetRunGlobals();
  }

  // Runs the engine silently over `selection`; the reporter.
  std::shared_ptr<APIProgress> Update(
      const std::shared_ptr<kelSortedCVProjects>& selection) {
    auto progress = APIProgress::Create();
    kelModelUpdateEngine engine;
    engine.UpdateModel(scene_.App(), selection, progress, nullptr, true);
    return progress;
  }

  // "Odd" is served by a test's own server, when the test registers one.
  UpdateScene scene_{"engine", {{"VB"}, {"Java"}, {"Odd", "kelqlnTest.Odd"}}};
  std::shared_ptr<platform::ManualClock> clock_ =
      std::make_shared<platform::ManualClock>();
};

TEST_F(EngineTest, AProjectWithoutCodeViewProjectIsReportedAndDropped) {
  auto without_code =
      scene_.Model()->RootComponentPackage()->NewComponent("Unbound");
  without_code->SetLanguage("VB");
  auto orders = scene_.AddComponent("Orders", "VB");
  scene_.WriteCode("Orders", kCode);
  auto selection = std::make_shared<kelSortedCVProjects>();
  for (const auto& component : {without_code, orders}) {
    selection->AddProject(nullptr, component)->SetIsAllComponentsSelected(true);
  }

  auto progress = Update(selection);

  // The add-in's warning, then the engine's error; no line of the project's
  // own.
  EXPECT_EQ(TextsOf(progress->Warnings()).size(), 1u);
  EXPECT_EQ(TextsOf(progress->Errors()),
            (Lines{"Error: No code-view project could be opened for a VB "
                   "component."}));
  EXPECT_EQ(
      TextsOf(progress->Summaries()),
      (Lines{"Components updated:", "Orders", "Orders: updated", kTotals}));
  EXPECT_EQ(selection->GetIncludedLanguages().Count(), 0);
  EXPECT_NE(scene_.ModelClass("A"), nullptr);
}

TEST_F(EngineTest, ALanguageLeftWithoutProjectsIsAnnouncedAndPassedOver) {
  // The wizard filed the component under VB, and again under Java after its
  // language changed: the first project's clean-up removes both entries.
  auto orders = scene_.AddComponent("Orders", "VB");
  scene_.WriteCode("Orders", kCode);
  auto selection = std::make_shared<kelSortedCVProjects>();
  selection->AddProject(nullptr, orders)->SetIsAllComponentsSelected(true);
  orders->SetLanguage("Java");
  selection->AddProject(nullptr, orders);
  orders->SetLanguage("VB");

  auto progress = Update(selection);

  EXPECT_EQ(TextsOf(progress->Summaries()),
            (Lines{"Components updated:", "Orders", "Orders: updated",
                   "Components updated:", kTotals}));
  Lines logs = TextsOf(progress->Logs());
  ASSERT_GE(logs.size(), 5u);
  EXPECT_EQ(
      Lines(logs.end() - 5, logs.end() - 3),
      (Lines{"----------------------------------------", "Language Java"}));
  EXPECT_EQ(TextsOf(progress->Errors()), Lines{});
}

TEST_F(EngineTest, AProjectTheCleanUpCannotFindIsPassedOverAllTheSame) {
  // The add-in hands back another component with the project: the clean-up
  // looks for that one's entry, finds none, and the loop must still end.
  auto component = scene_.AddComponent("First", "Odd");
  auto stand_in = scene_.AddComponent("StandIn", "Odd");
  auto project = testing_support::RecordingObject::Create(
      [](automation::DispId id, automation::CallKind, automation::Args&) {
        if (id == external::code_view::project::kComponents) {
          return automation::Variant(automation::Collection::Create());
        }
        return id == external::code_view::project::kName
                   ? automation::Variant("OddProject")
                   : automation::Variant();
      });
  auto server = testing_support::RecordingObject::Create();
  server->responder = [&](automation::DispId id, automation::CallKind,
                          automation::Args& args) {
    if (id !=
        server->IdOfName(external::code_view::rte_server::kCodeViewProject))
      return automation::Variant();
    args.at(0) = automation::Variant(automation::Object(stand_in));
    return automation::Variant(automation::Object(project));
  };
  automation::RegisterClass("kelqlnTest.Odd", "",
                            [server] { return automation::Object(server); });
  auto selection = std::make_shared<kelSortedCVProjects>();
  selection->AddProject(nullptr, component);

  auto progress = Update(selection);

  EXPECT_EQ(
      TextsOf(progress->Summaries()),
      (Lines{"Components updated:", "StandIn", "StandIn: updated", kTotals}));
  EXPECT_EQ(project->CallsTo(external::code_view::project::kOpen).size(), 1u);
  server->calls.clear();
  automation::UnregisterClass("kelqlnTest.Odd");
}

TEST_F(EngineTest, EachProjectWaitsAsLongAsTheRegistrySays) {
  const struct {
    std::optional<uint32_t> project_pause;
    std::vector<uint32_t> sleeps;
  } kCases[] = {
      {std::nullopt, {1000, 1000}},
      {250, {250, 250}},
      {0, {}},
  };
  for (const char* name : {"Orders", "Billing"}) {
    scene_.AddComponent(name, "VB");
    scene_.WriteCode(name, kCode);
  }
  for (const auto& row : kCases) {
    if (row.project_pause) {
      scene_.SetSetting(UpdateScene::kSettingsAddIn, "ProjectPause",
                        *row.project_pause);
    } else {
      scene_.RemoveSetting(UpdateScene::kSettingsAddIn, "ProjectPause");
    }
    auto selection = std::make_shared<kelSortedCVProjects>();
    for (const auto& component : scene_.Model()->Components()) {
      selection->AddProject(nullptr, component);
    }
    clock_ = std::make_shared<platform::ManualClock>();
    // A pause that begins just before midnight lasts as long as any other.
    clock_->SetSecondsSinceMidnight(86399.5f);
    platform::SetClock(clock_);
    Update(selection);
    EXPECT_EQ(clock_->Sleeps(), row.sleeps);
  }
}

}  // namespace
}  // namespace kelqln
