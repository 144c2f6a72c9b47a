#include "reporting/api_progress.h"

#include <gtest/gtest.h>

#include <functional>
#include <map>
#include <memory>
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
#include "external/string_service.h"
#include "platform/message_pump.h"
#include "reporting/reporter_api_dispatch.h"
#include "reporting/reporter_classes.h"
#include "tests/support/recording_object.h"

namespace kelqln {
namespace {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::DispId;
using automation::Variant;
using testing::RecordingObject;
namespace pd = external::progress_display;
namespace sd = external::status_display;

std::vector<std::string> Texts(
    const std::shared_ptr<automation::Collection>& c) {
  std::vector<std::string> texts;
  for (const Variant& item : c->Items()) texts.push_back(CStr(item));
  return texts;
}

std::vector<std::string> TextArgs(
    const std::vector<RecordingObject::Call>& calls) {
  std::vector<std::string> texts;
  for (const auto& call : calls) texts.push_back(CStr(call.args.at(0)));
  return texts;
}

int ErrorOf(const std::function<void()>& f) {
  try {
    f();
  } catch (const automation::Error& error) {
    return error.Number();
  }
  return 0;
}

class APIProgressTest : public ::testing::Test {
 protected:
  void SetUp() override {
    strings_ = RecordingObject::Create(
        [this](DispId id, CallKind, Args& args) -> Variant {
          if (id != external::string_service::kText) return {};
          return prefixes_.at(automation::CLng(args.at(0)));
        });
    SetStringRes(strings_);
    SetOrelApp(app_);
    platform::SetPumpHook([this] { ++pumps_; });
  }
  void TearDown() override {
    platform::SetPumpHook(nullptr);
    ResetRunGlobals();
  }

  // The texts the modelling tool's log received.
  std::vector<std::string> ToolLog() const {
    return TextArgs(app_->CallsTo(external::orel::application::kLog));
  }

  std::map<int32_t, std::string> prefixes_{{30106, "E: "}, {30107, "W: "}};
  std::shared_ptr<RecordingObject> strings_;
  std::shared_ptr<RecordingObject> app_ = RecordingObject::Create();
  std::shared_ptr<APIProgress> progress_ = APIProgress::Create();
  int pumps_ = 0;
};

TEST_F(APIProgressTest, WithoutDisplaysCountsAreZeroWhileCollectionsFill) {
  kelReporterApi& api = *progress_;
  std::string error = "broken";
  std::string warning = "odd";
  api.Error(error);
  api.Warning(warning);
  api.Log("note");
  api.Summary("done");
  api.TickCount(3, true);
  api.Tick("a");
  api.ClearStatus();
  progress_->SetShowLogOnDemand(true);
  progress_->SetShowSummaryOnDemand(true);

  EXPECT_EQ(api.ErrorCount(), 0);
  EXPECT_EQ(api.WarningCount(), 0);
  EXPECT_EQ(api.Task(1, 2, 3), 0);
  EXPECT_FALSE(progress_->ShowLogOnDemand());
  EXPECT_FALSE(progress_->ShowSummaryOnDemand());
  EXPECT_EQ(Texts(progress_->Errors()), std::vector<std::string>{"E: broken"});
  EXPECT_EQ(Texts(progress_->Warnings()), std::vector<std::string>{"W: odd"});
  EXPECT_EQ(Texts(progress_->Logs()), std::vector<std::string>{"note"});
  EXPECT_EQ(Texts(progress_->Summaries()), std::vector<std::string>{"done"});
}

TEST_F(APIProgressTest, PrefixedTextComesBackOnlyThroughTheReporterInterface) {
  kelReporterApi& api = *progress_;
  IReporter& reporter = *progress_;
  std::string error = "a";
  std::string warning = "b";
  api.Error(error);
  api.Warning(warning);
  EXPECT_EQ(error, "E: a");
  EXPECT_EQ(warning, "W: b");

  std::string kept_error = "c";
  std::string kept_warning = "d";
  reporter.Error(kept_error);
  reporter.Warning(kept_warning);
  EXPECT_EQ(kept_error, "c");
  EXPECT_EQ(kept_warning, "d");

  // A late-bound caller that passed the text by reference finds it rewritten.
  Args args{Variant("e")};
  automation::InvokeByName(progress_, external::reporter_api::kError,
                           CallKind::kMethod, args);
  EXPECT_EQ(CStr(args[0]), "E: e");

  EXPECT_EQ(Texts(progress_->Errors()),
            (std::vector<std::string>{"E: a", "E: c", "E: e"}));
  EXPECT_EQ(Texts(progress_->Warnings()),
            (std::vector<std::string>{"W: b", "W: d"}));
}

TEST_F(APIProgressTest, PrefixesAreFetchedAtEachCall) {
  kelReporterApi& api = *progress_;
  std::string first = "x";
  api.Error(first);
  prefixes_[30106] = "Fehler: ";
  std::string second = "y";
  api.Error(second);
  EXPECT_EQ(Texts(progress_->Errors()),
            (std::vector<std::string>{"E: x", "Fehler: y"}));
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
    kelReporterApi& api = *progress;
    std::string warning = "w";
    std::string error = "e";
    api.Summary("s1");
    api.Log("l");
    api.Warning(warning);
    api.Error(error);
    static_cast<IReporter&>(*progress).Summary("s2");
    automation::CallByName(progress, external::reporter_api::kSummary, "s3");
    automation::Call(progress, APIProgress::kSummary, "s4");

    EXPECT_EQ(ToolLog(), (std::vector<std::string>{"l", "W: w", "E: e"}));
    EXPECT_EQ(Texts(progress->Summaries()),
              (std::vector<std::string>{"s1", "s2", "s3", "s4"}));
  }
}

TEST_F(APIProgressTest, DisplaysReceiveTheirMembersWithTheirArguments) {
  struct Case {
    const char* name;
    std::function<void(APIProgress&)> operation;
    std::vector<DispId> progress_calls;
    std::vector<DispId> status_calls;
    Args last_args;  // of the last call made
  };
  auto api = [](APIProgress& p) -> kelReporterApi& { return p; };
  const std::vector<Case> cases = {
      {"TickCount",
       [&](APIProgress& p) { api(p).TickCount(4, true); },
       {pd::kTickCount},
       {},
       {Variant(int16_t{4}), Variant(true)}},
      {"TickText",
       [&](APIProgress& p) { api(p).TickText("t", false); },
       {pd::kTickText},
       {},
       {Variant("t"), Variant(false)}},
      {"Tick",
       [&](APIProgress& p) { api(p).Tick("n"); },
       {pd::kTick},
       {},
       {Variant("n")}},
      {"ClearTask",
       [&](APIProgress& p) { api(p).ClearTask(); },
       {pd::kClearTask},
       {},
       {}},
      {"ComponentCount",
       [&](APIProgress& p) { api(p).ComponentCount(2); },
       {pd::kComponentCount},
       {},
       {Variant(int16_t{2})}},
      {"Component",
       [&](APIProgress& p) { api(p).Component("c"); },
       {pd::kComponent},
       {},
       {Variant("c")}},
      {"TotalClassCount",
       [&](APIProgress& p) { api(p).TotalClassCount(5); },
       {pd::kTotalClassCount},
       {},
       {Variant(int16_t{5})}},
      {"ClassCount",
       [&](APIProgress& p) { api(p).ClassCount(6); },
       {pd::kClassCount},
       {},
       {Variant(int16_t{6})}},
      {"Class",
       [&](APIProgress& p) { api(p).Class("k"); },
       {pd::kClass},
       {},
       {Variant("k")}},
      {"TotalMemberCount",
       [&](APIProgress& p) { api(p).TotalMemberCount(7); },
       {pd::kTotalMemberCount},
       {},
       {Variant(int16_t{7})}},
      {"MemberCount",
       [&](APIProgress& p) { api(p).MemberCount(8); },
       {pd::kTickCount},
       {},
       {Variant(int16_t{8})}},
      {"Log",
       [&](APIProgress& p) { api(p).Log("l"); },
       {},
       {sd::kLog},
       {Variant("l")}},
      {"Summary",
       [&](APIProgress& p) { api(p).Summary("s"); },
       {},
       {sd::kSummary},
       {Variant("s")}},
      {"Warning",
       [&](APIProgress& p) {
         std::string text = "w";
         api(p).Warning(text);
       },
       {pd::kAddWarning},
       {sd::kWarning},
       {Variant("W: w")}},
      {"Error",
       [&](APIProgress& p) {
         std::string text = "e";
         api(p).Error(text);
       },
       {pd::kAddError},
       {sd::kError},
       {Variant("E: e")}},
      {"ClearStatusCounts",
       [&](APIProgress& p) { api(p).ClearStatusCounts(); },
       {pd::kClearStatusCounts},
       {},
       {}},
      {"ClearStatus",
       [&](APIProgress& p) { api(p).ClearStatus(); },
       {pd::kClearStatusCounts},
       {sd::kClear},
       {}},
      {"ComponentHeader",
       [](APIProgress& p) { p.ComponentHeader("h"); },
       {pd::kComponentHeader},
       {},
       {Variant("h")}},
      {"ClassHeader",
       [](APIProgress& p) { p.ClassHeader("h"); },
       {pd::kClassHeader},
       {},
       {Variant("h")}},
      {"ErrorWarningString",
       [](APIProgress& p) { p.ErrorWarningString("h"); },
       {pd::kErrorWarningString},
       {},
       {Variant("h")}},
      {"MemberProgressString",
       [](APIProgress& p) { p.MemberProgressString("h"); },
       {pd::kMemberProgressString},
       {},
       {Variant("h")}},
      {"SummaryErrorHeader",
       [](APIProgress& p) { p.SummaryErrorHeader("h"); },
       {},
       {sd::kSummaryErrorHeader},
       {Variant("h")}},
      {"SummaryWarningHeader",
       [](APIProgress& p) { p.SummaryWarningHeader("h"); },
       {},
       {sd::kSummaryWarningHeader},
       {Variant("h")}},
      {"ShowLog", [](APIProgress& p) { p.ShowLog(); }, {}, {sd::kShowLog}, {}},
      {"ShowSummary",
       [](APIProgress& p) { p.ShowSummary(); },
       {},
       {sd::kShowSummary},
       {}},
  };
  auto ids = [](const RecordingObject& display) {
    std::vector<DispId> made;
    for (const auto& call : display.calls) made.push_back(call.id);
    return made;
  };
  auto same = [](const Args& a, const Args& b) {
    if (a.size() != b.size()) return false;
    for (size_t i = 0; i < a.size(); ++i) {
      if (a[i].Type() != b[i].Type() || CStr(a[i]) != CStr(b[i])) return false;
    }
    return true;
  };
  for (const Case& test : cases) {
    SCOPED_TRACE(test.name);
    auto progress_display = RecordingObject::Create();
    auto status_display = RecordingObject::Create();
    auto progress = APIProgress::Create();
    progress->SetProgressDisplay(progress_display);
    progress->SetStatusDisplay(status_display);
    test.operation(*progress);
    EXPECT_EQ(ids(*progress_display), test.progress_calls);
    EXPECT_EQ(ids(*status_display), test.status_calls);
    const RecordingObject& last =
        test.status_calls.empty() ? *progress_display : *status_display;
    ASSERT_FALSE(last.calls.empty());
    EXPECT_TRUE(same(last.calls.back().args, test.last_args));
  }
}

TEST_F(APIProgressTest, CountsTaskAndSwitchesAreReadFromTheDisplays) {
  auto progress_display =
      RecordingObject::Create([](DispId id, CallKind, Args& args) -> Variant {
        if (id == pd::kErrorCount) return int32_t{3};
        if (id == pd::kWarningCount) return "2";
        if (id == pd::kTask) return int32_t{CInt(args[0]) + CInt(args[2])};
        return {};
      });
  bool log_on_demand = false;
  auto status_display = RecordingObject::Create(
      [&](DispId id, CallKind kind, Args& args) -> Variant {
        if (id != sd::kShowLogOnDemand) return {};
        if (kind == CallKind::kPropertyPut) log_on_demand = CBool(args.back());
        return log_on_demand;
      });
  progress_->SetProgressDisplay(progress_display);
  progress_->SetStatusDisplay(status_display);
  kelReporterApi& api = *progress_;
  EXPECT_EQ(api.ErrorCount(), 3);
  EXPECT_EQ(api.WarningCount(), 2);
  EXPECT_EQ(api.Task(4, 0, 5), 9);

  automation::Let(progress_, APIProgress::kShowLogOnDemand, true);
  EXPECT_TRUE(log_on_demand);
  EXPECT_TRUE(CBool(automation::Get(progress_, APIProgress::kShowLogOnDemand)));

  // Cleared displays are no longer called.
  progress_->SetProgressDisplay(nullptr);
  progress_->SetStatusDisplay(nullptr);
  size_t calls = progress_display->calls.size() + status_display->calls.size();
  api.Tick("after");
  api.Log("after");
  EXPECT_EQ(api.ErrorCount(), 0);
  EXPECT_EQ(progress_display->calls.size() + status_display->calls.size(),
            calls);
}

TEST_F(APIProgressTest, MemberMovesTheProgressDisplayLikeTick) {
  auto by_tick = RecordingObject::Create();
  auto by_member = RecordingObject::Create();
  progress_->SetProgressDisplay(by_tick);
  static_cast<kelReporterApi&>(*progress_).Tick("m");
  progress_->SetProgressDisplay(by_member);
  static_cast<kelReporterApi&>(*progress_).Member("m");
  ASSERT_EQ(by_member->calls.size(), 1u);
  EXPECT_EQ(by_member->calls[0].id, by_tick->calls[0].id);
  EXPECT_EQ(CStr(by_member->calls[0].args.at(0)), "m");
  EXPECT_EQ(by_member->calls[0].args.size(), by_tick->calls[0].args.size());
}

TEST_F(APIProgressTest, NameAndTickOperationsLetWindowMessagesRun) {
  struct Case {
    const char* name;
    std::function<void(kelReporterApi&)> operation;
    int pumps;
  };
  const std::vector<Case> cases = {
      {"TickText", [](kelReporterApi& r) { r.TickText("t", true); }, 1},
      {"Tick", [](kelReporterApi& r) { r.Tick("t"); }, 1},
      {"Component", [](kelReporterApi& r) { r.Component("c"); }, 1},
      {"Class", [](kelReporterApi& r) { r.Class("k"); }, 1},
      {"Member", [](kelReporterApi& r) { r.Member("m"); }, 2},
      {"TickCount", [](kelReporterApi& r) { r.TickCount(1, false); }, 0},
      {"Log", [](kelReporterApi& r) { r.Log("l"); }, 0},
  };
  for (const Case& test : cases) {
    SCOPED_TRACE(test.name);
    pumps_ = 0;
    test.operation(*progress_);
    EXPECT_EQ(pumps_, test.pumps);
  }
}

TEST_F(APIProgressTest, RaiseCancelSetsTheFlagRaisesTheEventAndTellsTheTarget) {
  struct Case {
    const char* name;
    bool with_target;
    bool with_sink;
  };
  for (const Case& test :
       {Case{"alone", false, false}, Case{"target", true, false},
        Case{"sink", false, true}, Case{"both", true, true}}) {
    SCOPED_TRACE(test.name);
    auto progress = APIProgress::Create();
    auto target = RecordingObject::Create();
    auto sink = RecordingObject::Create();
    auto left = RecordingObject::Create();
    progress->Advise(left);
    progress->Unadvise(left);
    if (test.with_target) {
      automation::CallByName(progress, external::reporter_api::kSetCancel,
                             automation::Object(target));
    }
    if (test.with_sink) progress->Advise(sink);
    EXPECT_FALSE(progress->Cancel());

    progress->RaiseCancel();
    EXPECT_TRUE(progress->Cancel());
    EXPECT_TRUE(CBool(
        automation::CallByName(progress, external::reporter_api::kCancel)));
    EXPECT_EQ(target->CallsTo(external::reporter_api::kDoCancel).size(),
              test.with_target ? 1u : 0u);
    EXPECT_EQ(sink->CallsTo(APIProgress::kDoCancel).size(),
              test.with_sink ? 1u : 0u);
    EXPECT_TRUE(left->calls.empty());
  }
}

TEST_F(APIProgressTest, LateBoundInterfacesAnswerByNumberAndByName) {
  auto progress_display =
      RecordingObject::Create([](DispId id, CallKind, Args&) -> Variant {
        return id == pd::kErrorCount ? Variant(int16_t{1}) : Variant();
      });
  progress_->SetProgressDisplay(progress_display);
  automation::Call(progress_, APIProgress::kComponentHeader, "Components");
  EXPECT_EQ(TextArgs(progress_display->CallsTo(pd::kComponentHeader)),
            std::vector<std::string>{"Components"});

  automation::CallByName(progress_, "Log", "line");
  automation::LetByName(progress_, external::reporter_api::kInformationType,
                        int32_t{42});
  EXPECT_EQ(automation::CLng(automation::GetByName(
                progress_, external::reporter_api::kInformationType)),
            42);
  EXPECT_EQ(automation::CInt(automation::CallByName(
                progress_, external::reporter_api::kErrorCount)),
            1);
  automation::Object logs =
      automation::CObj(automation::Call(progress_, APIProgress::kLogs));
  EXPECT_EQ(logs, automation::Object(progress_->Logs()));
  EXPECT_EQ(automation::CLng(automation::GetByName(logs, "Count")), 1);
  EXPECT_EQ(progress_->TypeName(), "APIProgress");
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
  }
  for (const char* prog_id :
       {"kelQLN.APIProgress", "kelQLN.shared_simplereporter"}) {
    SCOPED_TRACE(prog_id);
    automation::Object object = automation::CreateObject(prog_id);
    std::shared_ptr<kelReporterApi> reporter = ReporterOf(object);
    ASSERT_NE(reporter, nullptr);
    EXPECT_EQ(ReporterObject(reporter), object);
    automation::UnregisterClass(prog_id);
  }
  EXPECT_EQ(ReporterOf(Variant(nullptr)), nullptr);
  EXPECT_EQ(ErrorOf([] { ReporterOf(RecordingObject::Create()); }),
            automation::kTypeMismatch);
}

TEST_F(APIProgressTest, ToolLogFailureReachesTheCaller) {
  SetOrelApp(nullptr);
  EXPECT_EQ(
      ErrorOf([this] { static_cast<kelReporterApi&>(*progress_).Log("x"); }),
      automation::kObjectNotSet);
}

}  // namespace
}  // namespace kelqln
