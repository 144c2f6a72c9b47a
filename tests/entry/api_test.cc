// The wizard road of the API object with a wizard that only records what it
// is asked (the wizard library is not part of this program).
#include "entry/api.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/collection.h"
#include "entry/run_globals.h"
#include "entry/wizard_bridge.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "external/progress_display.h"
#include "host/modeltool/logical_package.h"
#include "selection/kel_sorted_class.h"
#include "selection/kel_sorted_component.h"
#include "selection/kel_sorted_components.h"
#include "tests/support/recording_object.h"
#include "tests/support/update_scene.h"

namespace kelqln {
namespace {

using automation::Object;
using automation::Variant;
using testing_support::Lines;
using testing_support::RecordingObject;

class RecordingWizard : public WizardBridge {
 public:
  void DisplaySummaryPage() override { steps.push_back("DisplaySummaryPage"); }
  Object ProgressControl() override { return progress; }
  Object StatusControl() override { return status; }
  void SetNewSelection(bool value) override {
    steps.push_back(std::string("SetNewSelection ") + (value ? "1" : "0"));
  }
  void Load() override { steps.push_back("Load"); }
  void Show(int32_t lMode) override {
    steps.push_back("Show " + std::to_string(lMode));
  }
  void Unload() override { steps.push_back("Unload"); }

  std::shared_ptr<RecordingObject> progress = RecordingObject::Create();
  std::shared_ptr<RecordingObject> status = RecordingObject::Create();
  Lines steps;
};

// Each component of the model selection with its classes, "Orders: Order".
Lines Filed(const kelSortedComponents& selection) {
  Lines filed;
  for (const std::string& language : selection.GetIncludedLanguages()) {
    auto components = selection.GetComponents(language);
    for (const auto& component : *components) {
      std::string line =
          automation::CStr(automation::Get(component->Component(), 100)) + ":";
      for (const auto& cls : *component->Classes()) {
        line += " " + automation::CStr(automation::Get(cls->Class(), 100));
      }
      filed.push_back(line);
    }
  }
  return filed;
}

class ApiWizardRoadTest : public ::testing::Test {
 protected:
  void SetUp() override {
    SetWizardBridge(wizard_);
    auto domain = scene_.Model()->RootLogicalPackage()->NewPackage("Domain");
    orders_ = scene_.AddComponent("Orders", "VB");
    billing_ = scene_.AddComponent("Billing", "VB");
    for (const char* name : {"Order", "Customer"}) {
      domain->NewClass(name)->AssignTo(orders_);
    }
    invoice_ = domain->NewClass("Invoice");
    invoice_->AssignTo(billing_);
  }
  void TearDown() override {
    SetWizardBridge(nullptr);
    ResetRunGlobals();
  }

  testing_support::UpdateScene scene_{"api", {{"VB"}}};
  std::shared_ptr<RecordingWizard> wizard_ =
      std::make_shared<RecordingWizard>();
  std::shared_ptr<host::modeltool::Component> orders_;
  std::shared_ptr<host::modeltool::Component> billing_;
  std::shared_ptr<host::modeltool::Class> invoice_;
};

TEST_F(ApiWizardRoadTest, AModelSelectionIsFiledAndTheWizardShownOnIt) {
  auto selection = automation::Collection::Create();
  for (const Variant& item :
       {Variant(Object(invoice_)), Variant("Orders\\Customer"),
        Variant("Orders"), Variant("Nope\\Order"),
        Variant(Object(scene_.Model()->RootLogicalPackage()))}) {
    selection->Items().Add(item);
  }
  auto api = API::Create();
  std::shared_ptr<IReporter> reporter =
      api->StartQuillonEx(scene_.App(), API::kModeless, true, selection);

  EXPECT_EQ(Filed(*GetSelectedOrelItems()),
            (Lines{"Billing: Invoice", "Orders: Customer"}));
  // A selection given: the wizard does not build its own.
  EXPECT_EQ(wizard_->steps, (Lines{"Load", "Show 0", "Unload"}));
  auto headers = [this](automation::DispId id) {
    Lines texts;
    for (const auto& call : wizard_->progress->CallsTo(id)) {
      texts.push_back(automation::CStr(call.args.at(0)));
    }
    return texts;
  };
  EXPECT_EQ(headers(external::progress_display::kComponentHeader),
            Lines{"Component"});
  EXPECT_EQ(headers(external::progress_display::kClassHeader), Lines{"Class"});
  EXPECT_FALSE(GetQuillonAPI());
  // The wizard is gone: the reporter drives no display any more.
  size_t calls = wizard_->progress->calls.size();
  ASSERT_TRUE(reporter);
  reporter->Error("late");
  EXPECT_EQ(wizard_->progress->calls.size(), calls);
}

TEST_F(ApiWizardRoadTest, WithoutSelectionTheWizardOrTheEnvironmentGivesIt) {
  auto api = API::Create();
  api->StartQuillonEx(scene_.App(), API::kModal, true, nullptr);
  EXPECT_EQ(wizard_->steps,
            (Lines{"SetNewSelection 1", "Load", "Show 1", "Unload"}));
  EXPECT_FALSE(GetSelectedOrelItems());

  // The development environment's projects name their model components.
  Object server = automation::CObj(automation::CallByName(
      automation::GetObject(scene_.App()->AddIns()->Find("VB"),
                            external::orel::add_in::kServer),
      external::code_view::add_in_server::kGetRteServer));
  auto projects = automation::Collection::Create();
  projects->Items().Add(automation::CallByName(
      server, external::code_view::rte_server::kCodeViewProject,
      Object(billing_), nullptr));
  wizard_->steps.clear();
  api->StartQuillonFromIDE(scene_.App(), projects, true);
  EXPECT_EQ(Filed(*GetSelectedOrelItems()), Lines{"Billing: Invoice"});
  EXPECT_EQ(wizard_->steps,
            (Lines{"SetNewSelection 0", "Load", "Show 1", "Unload"}));
}

}  // namespace
}  // namespace kelqln
