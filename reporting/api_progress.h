// The reporter of one run. The engine and the selection code report through
// kelReporterApi; the caller reads the collected texts through IReporter;
// while the wizard shows the run, the reporter also drives the wizard's
// progress and status displays, and late-bound hosts drive it through
// _APIProgress. Without displays (a silent run) only the collections and the
// modelling tool's log receive the texts.
#ifndef KELQLN_REPORTING_API_PROGRESS_H_
#define KELQLN_REPORTING_API_PROGRESS_H_

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "automation/collection.h"
#include "automation/member_table.h"
#include "automation/server_module.h"
#include "entry/server_module.h"
#include "reporting/i_reporter.h"
#include "reporting/kel_reporter_api.h"

namespace kelqln {

class APIProgress : public automation::DispatchImpl<APIProgress>,
                    public kelReporterApi,
                    public IReporter {
 public:
  static constexpr char kProgId[] = "kelQLN.APIProgress";
  static constexpr char kClassId[] = "{6B0C2E41-7A3D-4F1B-9C55-0E2A61D4B701}";

  // _APIProgress
  static constexpr automation::DispId kShowSummaryPage = 0x60030005;
  static constexpr automation::DispId kComponentHeader = 0x60030006;
  static constexpr automation::DispId kClassHeader = 0x60030007;
  static constexpr automation::DispId kErrorWarningString = 0x60030008;
  static constexpr automation::DispId kMemberProgressString = 0x60030009;
  static constexpr automation::DispId kSummary = 0x6003000a;
  static constexpr automation::DispId kSummaryErrorHeader = 0x6003000b;
  static constexpr automation::DispId kSummaryWarningHeader = 0x6003000c;
  static constexpr automation::DispId kShowLogOnDemand = 0x68030001;
  static constexpr automation::DispId kShowSummaryOnDemand = 0x68030000;
  static constexpr automation::DispId kShowLog = 0x60030025;
  static constexpr automation::DispId kShowSummary = 0x60030026;
  static constexpr automation::DispId kErrors = 0x60030027;
  static constexpr automation::DispId kWarnings = 0x60030028;
  static constexpr automation::DispId kLogs = 0x60030029;
  static constexpr automation::DispId kSummaries = 0x6003002a;
  // __APIProgress, the event interface a sink implements.
  static constexpr automation::DispId kDoCancel = 1;

  static std::shared_ptr<APIProgress> Create() {
    return std::make_shared<APIProgress>();
  }
  static const automation::MemberTable<APIProgress>& Members();

  // _APIProgress. Each display call is made only when that display is set.
  // Moves the wizard to its summary page (see entry/wizard_bridge.h).
  void ShowSummaryPage();
  void ComponentHeader(const std::string& value);
  void ClassHeader(const std::string& value);
  void ErrorWarningString(const std::string& value);
  void MemberProgressString(const std::string& value);
  void SummaryErrorHeader(const std::string& value);
  void SummaryWarningHeader(const std::string& value);
  // The status display's switches; False, and setting them does nothing,
  // without a status display.
  bool ShowLogOnDemand();
  void SetShowLogOnDemand(bool value);
  bool ShowSummaryOnDemand();
  void SetShowSummaryOnDemand(bool value);
  void ShowLog();
  void ShowSummary();

  // Event sinks: each is called with member kDoCancel when the run is
  // cancelled.
  void Advise(automation::Object sink);
  void Unadvise(const automation::Object& sink);

  // For the entry object: the wizard's displays (Nothing clears them), and
  // cancelling the run.
  void SetProgressDisplay(automation::Object control);
  void SetStatusDisplay(automation::Object control);
  // Marks the run cancelled, raises doCancel to the sinks, then tells the
  // cancel target "doCancel".
  void RaiseCancel();

  // kelReporterApi. The operations that show a name or a tick text let
  // pending window messages run afterwards, so the wizard stays live while
  // the engine works on the same thread. Log, Warning and Error lines go to
  // the modelling tool's log as well; summaries do not. Warning and Error put
  // the texts of strings 30107 and 30106 in front of the caller's text.
  bool Cancel() override { return cancelled_; }
  void SetCancel(automation::Object target) override;
  void TickCount(int16_t count, bool with_delay) override;
  void TickText(const std::string& text, bool clear) override;
  void Tick(const std::string& name) override;
  // 0 without a progress display.
  int16_t Task(int16_t component_count, int16_t class_count,
               int16_t member_count) override;
  void ClearTask() override;
  void ComponentCount(int16_t count) override;
  void Component(const std::string& name) override;
  void TotalClassCount(int16_t count) override;
  void ClassCount(int16_t count) override;
  void Class(const std::string& name) override;
  void TotalMemberCount(int16_t count) override;
  void MemberCount(int16_t count) override;
  void Member(const std::string& name) override;
  void Log(const std::string& text) override;
  void Summary(const std::string& text) override;
  void Warning(std::string& text) override;
  void Error(std::string& text) override;
  // The counts live in the progress display: 0 without one, however many
  // texts the collections hold.
  int16_t WarningCount() override;
  int16_t ErrorCount() override;
  void ClearStatusCounts() override;
  void ClearStatus() override;
  void SetInformationType(int32_t value) override { information_type_ = value; }
  int32_t InformationType() override { return information_type_; }

  // IReporter: the text operations work on a copy of the caller's text.
  std::shared_ptr<automation::Collection> Errors() override { return errors_; }
  std::shared_ptr<automation::Collection> Warnings() override {
    return warnings_;
  }
  std::shared_ptr<automation::Collection> Logs() override { return logs_; }
  std::shared_ptr<automation::Collection> Summaries() override {
    return summaries_;
  }
  void Error(std::string text) override;
  void Warning(std::string text) override;
  void Log(std::string text) override;
  void Summary(std::string text) override;

 private:
  // Declared first so that they are released last: the displays and the
  // cancel target go before the texts.
  std::shared_ptr<automation::Collection> errors_ =
      automation::Collection::Create();
  std::shared_ptr<automation::Collection> warnings_ =
      automation::Collection::Create();
  std::shared_ptr<automation::Collection> logs_ =
      automation::Collection::Create();
  std::shared_ptr<automation::Collection> summaries_ =
      automation::Collection::Create();

  automation::Object progress_display_;
  automation::Object status_display_;
  automation::Object cancel_target_;
  std::vector<automation::Object> sinks_;
  bool cancelled_ = false;
  int32_t information_type_ = 0;
  automation::ServerModule::LiveObject live_{KelQLNModule()};
};

}  // namespace kelqln

#endif  // KELQLN_REPORTING_API_PROGRESS_H_
