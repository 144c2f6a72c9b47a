#include "reporting/api_progress.h"

#include <algorithm>
#include <utility>

#include "automation/call.h"
#include "entry/run_globals.h"
#include "entry/wizard_bridge.h"
#include "external/orel.h"
#include "external/progress_display.h"
#include "external/reporter_api.h"
#include "external/status_display.h"
#include "platform/message_pump.h"
#include "reporting/reporter_api_dispatch.h"

namespace kelqln {
namespace {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::Object;
using automation::RequiredArg;
using automation::Variant;
namespace pd = external::progress_display;
namespace sd = external::status_display;

// Prefixes of the texts of warnings and errors.
constexpr int32_t kErrorPrefix = 30106;
constexpr int32_t kWarningPrefix = 30107;

// A display call, skipped when that display is not set.
template <class... A>
void CallDisplay(const Object& display, automation::DispId id, A&&... args) {
  if (display) automation::Call(display, id, std::forward<A>(args)...);
}

// The modelling tool's log of the run's application.
void ToolLog(const std::string& text) {
  automation::Call(GetOrelApp(), external::orel::application::kLog, text);
}

void Append(automation::Collection& texts, const std::string& text) {
  texts.Items().Add(Variant(text));
}

// A row of _APIProgress that passes its one text argument on.
automation::MemberTable<APIProgress>::Row TextRow(
    automation::DispId id, const char* name,
    void (APIProgress::*operation)(const std::string&)) {
  return {id, name, CallKind::kMethod,
          [operation](APIProgress& self, Args& args) {
            (self.*operation)(CStr(RequiredArg(args, 0)));
            return Variant();
          }};
}

}  // namespace

const automation::MemberTable<APIProgress>& APIProgress::Members() {
  static const automation::MemberTable<APIProgress> table(
      "APIProgress",
      WithReporterApiRows<APIProgress>({
          {kShowSummaryPage, "ShowSummaryPage", CallKind::kMethod,
           [](APIProgress& self, Args&) {
             self.ShowSummaryPage();
             return Variant();
           }},
          TextRow(kComponentHeader, "ComponentHeader",
                  &APIProgress::ComponentHeader),
          TextRow(kClassHeader, "ClassHeader", &APIProgress::ClassHeader),
          TextRow(kErrorWarningString, "ErrorWarningString",
                  &APIProgress::ErrorWarningString),
          TextRow(kMemberProgressString, "MemberProgressString",
                  &APIProgress::MemberProgressString),
          TextRow(kSummary, "Summary",
                  static_cast<void (APIProgress::*)(const std::string&)>(
                      &APIProgress::Summary)),
          TextRow(kSummaryErrorHeader, "SummaryErrorHeader",
                  &APIProgress::SummaryErrorHeader),
          TextRow(kSummaryWarningHeader, "SummaryWarningHeader",
                  &APIProgress::SummaryWarningHeader),
          {kShowLogOnDemand, "ShowLogOnDemand", CallKind::kPropertyGet,
           [](APIProgress& self, Args&) {
             return Variant(self.ShowLogOnDemand());
           }},
          {kShowLogOnDemand, "ShowLogOnDemand", CallKind::kPropertyPut,
           [](APIProgress& self, Args& args) {
             self.SetShowLogOnDemand(
                 automation::CBool(automation::PutValue(args)));
             return Variant();
           }},
          {kShowSummaryOnDemand, "ShowSummaryOnDemand", CallKind::kPropertyGet,
           [](APIProgress& self, Args&) {
             return Variant(self.ShowSummaryOnDemand());
           }},
          {kShowSummaryOnDemand, "ShowSummaryOnDemand", CallKind::kPropertyPut,
           [](APIProgress& self, Args& args) {
             self.SetShowSummaryOnDemand(
                 automation::CBool(automation::PutValue(args)));
             return Variant();
           }},
          {kShowLog, "ShowLog", CallKind::kMethod,
           [](APIProgress& self, Args&) {
             self.ShowLog();
             return Variant();
           }},
          {kShowSummary, "ShowSummary", CallKind::kMethod,
           [](APIProgress& self, Args&) {
             self.ShowSummary();
             return Variant();
           }},
          {kErrors, "Errors", CallKind::kMethod,
           [](APIProgress& self, Args&) { return Variant(self.errors_); }},
          {kWarnings, "Warnings", CallKind::kMethod,
           [](APIProgress& self, Args&) { return Variant(self.warnings_); }},
          {kLogs, "Logs", CallKind::kMethod,
           [](APIProgress& self, Args&) { return Variant(self.logs_); }},
          {kSummaries, "Summaries", CallKind::kMethod,
           [](APIProgress& self, Args&) { return Variant(self.summaries_); }},
      }));
  return table;
}

void APIProgress::ShowSummaryPage() { Wizard().DisplaySummaryPage(); }

void APIProgress::ComponentHeader(const std::string& value) {
  CallDisplay(progress_display_, pd::kComponentHeader, value);
}

void APIProgress::ClassHeader(const std::string& value) {
  CallDisplay(progress_display_, pd::kClassHeader, value);
}

void APIProgress::ErrorWarningString(const std::string& value) {
  CallDisplay(progress_display_, pd::kErrorWarningString, value);
}

void APIProgress::MemberProgressString(const std::string& value) {
  CallDisplay(progress_display_, pd::kMemberProgressString, value);
}

void APIProgress::SummaryErrorHeader(const std::string& value) {
  CallDisplay(status_display_, sd::kSummaryErrorHeader, value);
}

void APIProgress::SummaryWarningHeader(const std::string& value) {
  CallDisplay(status_display_, sd::kSummaryWarningHeader, value);
}

bool APIProgress::ShowLogOnDemand() {
  if (!status_display_) return false;
  return automation::CBool(
      automation::Get(status_display_, sd::kShowLogOnDemand));
}

void APIProgress::SetShowLogOnDemand(bool value) {
  if (status_display_)
    automation::Let(status_display_, sd::kShowLogOnDemand, value);
}

bool APIProgress::ShowSummaryOnDemand() {
  if (!status_display_) return false;
  return automation::CBool(
      automation::Get(status_display_, sd::kShowSummaryOnDemand));
}

void APIProgress::SetShowSummaryOnDemand(bool value) {
  if (status_display_) {
    automation::Let(status_display_, sd::kShowSummaryOnDemand, value);
  }
}

void APIProgress::ShowLog() { CallDisplay(status_display_, sd::kShowLog); }

void APIProgress::ShowSummary() {
  CallDisplay(status_display_, sd::kShowSummary);
}

void APIProgress::Advise(Object sink) {
  if (!sink) throw automation::Error(automation::kObjectRequired);
  sinks_.push_back(std::move(sink));
}

void APIProgress::Unadvise(const Object& sink) {
  auto found = std::find(sinks_.begin(), sinks_.end(), sink);
  if (found != sinks_.end()) sinks_.erase(found);
}

void APIProgress::SetProgressDisplay(Object control) {
  progress_display_ = std::move(control);
}

void APIProgress::SetStatusDisplay(Object control) {
  status_display_ = std::move(control);
}

void APIProgress::RaiseCancel() {
  cancelled_ = true;
  // A sink may leave (Unadvise) while it is being told.
  std::vector<Object> sinks = sinks_;
  for (const Object& sink : sinks) automation::Call(sink, kDoCancel);
  if (cancel_target_) {
    automation::CallByName(cancel_target_, external::reporter_api::kDoCancel);
  }
}

void APIProgress::SetCancel(Object target) {
  cancel_target_ = std::move(target);
}

void APIProgress::TickCount(int16_t count, bool with_delay) {
  CallDisplay(progress_display_, pd::kTickCount, count, with_delay);
}

void APIProgress::TickText(const std::string& text, bool clear) {
  CallDisplay(progress_display_, pd::kTickText, text, clear);
  platform::DoEvents();
}

void APIProgress::Tick(const std::string& name) {
  CallDisplay(progress_display_, pd::kTick, name);
  platform::DoEvents();
}

int16_t APIProgress::Task(int16_t component_count, int16_t class_count,
                          int16_t member_count) {
  if (!progress_display_) return 0;
  return automation::CInt(automation::Call(progress_display_, pd::kTask,
                                           component_count, class_count,
                                           member_count));
}

void APIProgress::ClearTask() {
  CallDisplay(progress_display_, pd::kClearTask);
}

void APIProgress::ComponentCount(int16_t count) {
  CallDisplay(progress_display_, pd::kComponentCount, count);
}

void APIProgress::Component(const std::string& name) {
  CallDisplay(progress_display_, pd::kComponent, name);
  platform::DoEvents();
}

void APIProgress::TotalClassCount(int16_t count) {
  CallDisplay(progress_display_, pd::kTotalClassCount, count);
}

void APIProgress::ClassCount(int16_t count) {
  CallDisplay(progress_display_, pd::kClassCount, count);
}

void APIProgress::Class(const std::string& name) {
  CallDisplay(progress_display_, pd::kClass, name);
  platform::DoEvents();
}

void APIProgress::TotalMemberCount(int16_t count) {
  CallDisplay(progress_display_, pd::kTotalMemberCount, count);
}

void APIProgress::MemberCount(int16_t count) {
  CallDisplay(progress_display_, pd::kTickCount, count);
}

void APIProgress::Member(const std::string& name) {
  Tick(name);
  platform::DoEvents();
}

void APIProgress::Log(const std::string& text) {
  CallDisplay(status_display_, sd::kLog, text);
  ToolLog(text);
  Append(*logs_, text);
}

void APIProgress::Summary(const std::string& text) {
  CallDisplay(status_display_, sd::kSummary, text);
  Append(*summaries_, text);
}

void APIProgress::Warning(std::string& text) {
  CallDisplay(progress_display_, pd::kAddWarning);
  text = StringResText(kWarningPrefix) + text;
  CallDisplay(status_display_, sd::kWarning, text);
  ToolLog(text);
  Append(*warnings_, text);
}

void APIProgress::Error(std::string& text) {
  CallDisplay(progress_display_, pd::kAddError);
  text = StringResText(kErrorPrefix) + text;
  CallDisplay(status_display_, sd::kError, text);
  ToolLog(text);
  Append(*errors_, text);
}

int16_t APIProgress::WarningCount() {
  if (!progress_display_) return 0;
  return automation::CInt(
      automation::Get(progress_display_, pd::kWarningCount));
}

int16_t APIProgress::ErrorCount() {
  if (!progress_display_) return 0;
  return automation::CInt(automation::Get(progress_display_, pd::kErrorCount));
}

void APIProgress::ClearStatusCounts() {
  CallDisplay(progress_display_, pd::kClearStatusCounts);
}

void APIProgress::ClearStatus() {
  CallDisplay(progress_display_, pd::kClearStatusCounts);
  CallDisplay(status_display_, sd::kClear);
}

void APIProgress::Error(std::string text) {
  static_cast<kelReporterApi&>(*this).Error(text);
}

void APIProgress::Warning(std::string text) {
  static_cast<kelReporterApi&>(*this).Warning(text);
}

void APIProgress::Log(std::string text) {
  static_cast<kelReporterApi&>(*this).Log(text);
}

void APIProgress::Summary(std::string text) {
  static_cast<kelReporterApi&>(*this).Summary(text);
}

}  // namespace kelqln
