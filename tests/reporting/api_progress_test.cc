#include "reporting/api_progress.h"

#include <gtest/gtest.h>

#include <functional>
#include <map>
#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/error.h"
#include "entry/run_globals.h"
#include "entry/wizard_bridge.h"
#include "external/orel.h"
#include "external/progress_display.h"
#include "external/reporter_api.h"
#include "external/status_display.h"
#include "platform/message_pump.h"
#include "reporting/reporter_api_dispatch.h"
#include "reporting/reporter_classes.h"
#include "tests/support/error_of.h"
#include "tests/support/recording_object.h"

namespace kelqln {
namespace {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::DispId;
using automation::Variant;
using testing_support::ErrorOf;
using testing_support::RecordingObject;
using Texts = std::vector<std::string>;
namespace names = external::reporter_api;
namespace pd = external::progress_display;
namespace sd = external::status_display;

Texts TextsOf(const std::shared_ptr<automation::Collection>& collection) {
  Texts texts;
  for (const Variant& item : collection->Items()) texts.push_back(CStr(item));
  return texts;
}

std::vector<DispId> IdsCalled(const RecordingObject& object) {
  std::vector<DispId> ids;
  for (const auto& call : object.calls) ids.push_back(call.id);
  return ids;
}

class APIProgressTest : public ::testing::Test {
 protected:
  void SetUp() override {
    SetStringRes(RecordingObject::Create([this](DispId, CallKind, Args& args) {
      return Variant(prefixes_.at(automation::CLng(args.at(0))));
    }));
    SetOrelApp(app_);
    platform::SetPumpHook([this] { ++pumps_; });
  }
  void TearDown() override {
    platform::SetPumpHook(nullptr);
    ResetRunGlobals();
  }

  Texts ToolLog() const {
    Texts texts;
    for (const auto& call : app_->CallsTo(external::orel::application::kLog)) {
      texts.push_back(CStr(call.args.at(0)));
    }
    return texts;
  }

  std::map<int32_t, std::string> prefixes_{{30106, "E: "}, {30107, "W: "}};
  std::shared_ptr<RecordingObject> app_ = RecordingObject::Create();
  std::shared_ptr<APIProgress> progress_ = APIProgress::Create();
  kelReporterApi& api_ = *progress_;
  int pumps_ = 0;
};

TEST_F(APIProgressTest, WithoutDisplaysCountsAreZeroWhileCollectionsFill) {
  std::string error = "broken";
  std::string warning = "odd";
  api_.Error(error);
  api_.Warning(warning);
  api_.Log("note");
  api_.Summary("done");
  api_.ClearStatus();
  progress_->SetShowLogOnDemand(true);
  progress_->SetShowSummaryOnDemand(true);

  EXPECT_EQ(api_.ErrorCount(), 0);
  EXPECT_EQ(api_.WarningCount(), 0);
  EXPECT_EQ(api_.Task(1, 2, 3), 0);
  EXPECT_FALSE(progress_->ShowLogOnDemand());
  EXPECT_FALSE(progress_->ShowSummaryOnDemand());
  EXPECT_EQ(TextsOf(progress_->Errors()), Texts{"E: broken"});
  EXPECT_EQ(TextsOf(progress_->Warnings()), Texts{"W: odd"});
  EXPECT_EQ(TextsOf(progress_->Logs()), Texts{"note"});
  EXPECT_EQ(TextsOf(progress_->Summaries()), Texts{"done"});
}

TEST_F(APIProgressTest, PrefixedTextComesBackOnlyThroughTheReporterInterface) {
  std::string error = "a";
  std::string warning = "b";
  api_.Error(error);
  api_.Warning(warning);
  EXPECT_EQ(error, "E: a");
  EXPECT_EQ(warning, "W: b");

  std::string kept = "c";
  static_cast<IReporter&>(*progress_).Error(kept);
  EXPECT_EQ(kept, "c");

  prefixes_[30106] = "Fehler: ";  // fetched anew at each call
  Args by_reference{Variant("d")};
  automation::InvokeByName(progress_, names::kError, CallKind::kMethod,
                           by_reference);
  EXPECT_EQ(CStr(by_reference[0]), "Fehler: d");
  EXPECT_EQ(TextsOf(progress_->Errors()), (Texts{"E: a", "E: c", "Fehler: d"}));
}

TEST_F(APIProgressTest, SummariesNeverReachTheToolLogTheOtherLinesAlwaysDo) {
  for (bool with_displays : {false, true}) {
    SCOPED_TRACE(with_displays);
    app_->calls.clear();
    auto progress = APIProgress::Create();
    if (with_displays) {
      progress->SetProgressDisplay(RecordingObject::Create());
      progress->SetStatusDisplay(RecordingObject::Create());
    }
    std::string warning = "w";
    static_cast<kelReporterApi&>(*progress).Summary("s1");
    static_cast<kelReporterApi&>(*progress).Log("l");
    static_cast<kelReporterApi&>(*progress).Warning(warning);
    static_cast<IReporter&>(*progress).Summary("s2");
    static_cast<IReporter&>(*progress).Error("e");
    automation::Call(progress, APIProgress::kSummary, "s3");

    EXPECT_EQ(ToolLog(), (Texts{"l", "W: w", "E: e"}));
    EXPECT_EQ(TextsOf(progress->Summaries()), (Texts{"s1", "s2", "s3"}));
  }
}

TEST_F(APIProgressTest, EachOperationCallsItsDisplayMembers) {
  struct Case {
    const char* name;  // reached late-bound, by name
    Args args;
    std::vector<DispId> progress_ids;
    std::vector<DispId> status_ids;
  };
  const Variant n(int16_t{4});
  const std::vector<Case> cases = {
      {"TickCount", {n, true}, {pd::kTickCount}, {}},
      {"TickText", {"t", false}, {pd::kTickText}, {}},
      {"Tick", {"t"}, {pd::kTick}, {}},
      {"ClearTask", {}, {pd::kClearTask}, {}},
      {"ComponentCount", {n}, {pd::kComponentCount}, {}},
      {"Component", {"c"}, {pd::kComponent}, {}},
      {"TotalClassCount", {n}, {pd::kTotalClassCount}, {}},
      {"ClassCount", {n}, {pd::kClassCount}, {}},
      {"Class", {"k"}, {pd::kClass}, {}},
      {"TotalMemberCount", {n}, {pd::kTotalMemberCount}, {}},
      {"MemberCount", {n}, {pd::kTickCount}, {}},
      {"Member", {"m"}, {pd::kTick}, {}},  // just as Tick
      {"Log", {"l"}, {}, {sd::kLog}},
      {"Summary", {"s"}, {}, {sd::kSummary}},
      {"Warning", {"w"}, {pd::kAddWarning}, {sd::kWarning}},
      {"Error", {"e"}, {pd::kAddError}, {sd::kError}},
      {"ClearStatusCounts", {}, {pd::kClearStatusCounts}, {}},
      {"ClearStatus", {}, {pd::kClearStatusCounts}, {sd::kClear}},
      {"ComponentHeader", {"h"}, {pd::kComponentHeader}, {}},
      {"ClassHeader", {"h"}, {pd::kClassHeader}, {}},
      {"ErrorWarningString", {"h"}, {pd::kErrorWarningString}, {}},
      {"MemberProgressString", {"h"}, {pd::kMemberProgressString}, {}},
      {"SummaryErrorHeader", {"h"}, {}, {sd::kSummaryErrorHeader}},
      {"SummaryWarningHeader", {"h"}, {}, {sd::kSummaryWarningHeader}},
      {"ShowLog", {}, {}, {sd::kShowLog}},
      {"ShowSummary", {}, {}, {sd::kShowSummary}},
  };
  for (const Case& test : cases) {
    SCOPED_TRACE(test.name);
    auto progress_display = RecordingObject::Create();
    auto status_display = RecordingObject::Create();
    auto progress = APIProgress::Create();
    progress->SetProgressDisplay(progress_display);
    progress->SetStatusDisplay(status_display);
    Args args = test.args;
    automation::InvokeByName(progress, test.name, CallKind::kMethod, args);
    EXPECT_EQ(IdsCalled(*progress_display), test.progress_ids);
    EXPECT_EQ(IdsCalled(*status_display), test.status_ids);
  }
}

TEST_F(APIProgressTest, CountsTaskAndSwitchesComeFromTheDisplays) {
  bool log_on_demand = false;
  auto progress_display =
      RecordingObject::Create([](DispId id, CallKind, Args& args) -> Variant {
        if (id == pd::kErrorCount) return int32_t{3};
        if (id == pd::kWarningCount) return "2";
        if (id == pd::kTask)
          return automation::CInt(args[0]) + automation::CInt(args[2]);
        return {};
      });
  auto status_display = RecordingObject::Create(
      [&](DispId id, CallKind kind, Args& args) -> Variant {
        if (kind == CallKind::kPropertyPut && id == sd::kShowLogOnDemand) {
          log_on_demand = automation::CBool(args.back());
        }
        return log_on_demand;
      });
  progress_->SetProgressDisplay(progress_display);
  progress_->SetStatusDisplay(status_display);
  EXPECT_EQ(api_.ErrorCount(), 3);
  EXPECT_EQ(api_.WarningCount(), 2);
  EXPECT_EQ(api_.Task(4, 0, 5), 9);
  automation::Let(progress_, APIProgress::kShowLogOnDemand, true);
  EXPECT_TRUE(log_on_demand);
  EXPECT_TRUE(automation::CBool(
      automation::Get(progress_, APIProgress::kShowLogOnDemand)));

  progress_->SetProgressDisplay(nullptr);  // as when the wizard unloads
  EXPECT_EQ(api_.ErrorCount(), 0);
}

TEST_F(APIProgressTest, NameAndTickOperationsLetWindowMessagesRun) {
  const std::vector<std::pair<std::function<void()>, int>> cases = {
      {[this] { api_.TickText("t", true); }, 1},
      {[this] { api_.Tick("t"); }, 1},
      {[this] { api_.Component("c"); }, 1},
      {[this] { api_.Class("k"); }, 1},
      {[this] { api_.Member("m"); }, 2},
      {[this] { api_.TickCount(1, false); }, 0},
      {[this] { api_.Log("l"); }, 0},
  };
  for (size_t i = 0; i < cases.size(); ++i) {
    pumps_ = 0;
    cases[i].first();
    EXPECT_EQ(pumps_, cases[i].second) << i;
  }
}

TEST_F(APIProgressTest, RaiseCancelSetsTheFlagRaisesTheEventAndTellsTheTarget) {
  for (int with : {0, 1, 2, 3}) {  // bit 0: a cancel target, bit 1: a sink
    SCOPED_TRACE(with);
    auto progress = APIProgress::Create();
    auto target = RecordingObject::Create();
    auto sink = RecordingObject::Create();
    auto left = RecordingObject::Create();
    progress->Advise(left);
    progress->Unadvise(left);
    if (with & 1) {
      automation::CallByName(progress, names::kSetCancel,
                             automation::Object(target));
    }
    if (with & 2) progress->Advise(sink);
    EXPECT_FALSE(progress->Cancel());

    progress->RaiseCancel();
    EXPECT_TRUE(
        automation::CBool(automation::CallByName(progress, names::kCancel)));
    EXPECT_EQ(target->CallsTo(names::kDoCancel).size(), (with & 1) ? 1u : 0u);
    EXPECT_EQ(sink->CallsTo(APIProgress::kDoCancel).size(),
              (with & 2) ? 1u : 0u);
    EXPECT_TRUE(left->calls.empty());
  }
}

TEST_F(APIProgressTest, SummaryPageNeedsTheWizard) {
  EXPECT_EQ(ErrorOf([this] { progress_->ShowSummaryPage(); }),
            automation::kCannotCreateObject);

  struct CountingWizard : WizardBridge {
    void DisplaySummaryPage() override { ++shown; }
    int shown = 0;
  };
  auto wizard = std::make_shared<CountingWizard>();
  SetWizardBridge(wizard);
  automation::Call(progress_, APIProgress::kShowSummaryPage);
  SetWizardBridge(nullptr);
  EXPECT_EQ(wizard->shown, 1);
}

TEST_F(APIProgressTest, ReportersAreCreatableByProgIdAndPassAsObjects) {
  for (const auto& server_class : ReporterServerClasses()) {
    automation::RegisterClass(server_class.prog_id, server_class.class_id,
                              server_class.factory);
    automation::Object object = automation::CreateObject(server_class.prog_id);
    std::shared_ptr<kelReporterApi> reporter = ReporterOf(object);
    ASSERT_NE(reporter, nullptr) << server_class.prog_id;
    EXPECT_EQ(ReporterObject(reporter), object);
    automation::UnregisterClass(server_class.prog_id);
  }
  EXPECT_EQ(ErrorOf([] { ReporterOf(RecordingObject::Create()); }),
            automation::kTypeMismatch);
}

}  // namespace
}  // namespace kelqln
