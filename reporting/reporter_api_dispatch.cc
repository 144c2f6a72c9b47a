#include "reporting/reporter_api_dispatch.h"

#include <string>

#include "automation/error.h"
#include "external/reporter_api.h"

namespace kelqln {
namespace {

using automation::Args;
using automation::CallKind;
using automation::CBool;
using automation::CInt;
using automation::CStr;
using automation::kNamedOnly;
using automation::RequiredArg;
using automation::Variant;
namespace names = external::reporter_api;

const Variant kNoResult;

// A text argument the reporter may rewrite: the caller that passed it by
// reference finds the new text in its argument.
template <class Operation>
Variant WithTextByReference(Args& args, Operation operation) {
  std::string text = CStr(RequiredArg(args, 0));
  operation(text);
  args[0] = Variant(text);
  return kNoResult;
}

}  // namespace

const std::vector<ReporterApiRow>& ReporterApiRows() {
  static const std::vector<ReporterApiRow> rows{
      {kNamedOnly, names::kCancel, CallKind::kMethod,
       [](kelReporterApi& self, Args&) { return Variant(self.Cancel()); }},
      {kNamedOnly, names::kSetCancel, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.SetCancel(automation::CObj(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kTickCount, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.TickCount(CInt(RequiredArg(args, 0)),
                        CBool(RequiredArg(args, 1)));
         return kNoResult;
       }},
      {kNamedOnly, names::kTickText, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.TickText(CStr(RequiredArg(args, 0)), CBool(RequiredArg(args, 1)));
         return kNoResult;
       }},
      {kNamedOnly, names::kTick, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.Tick(CStr(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kTask, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         return Variant(self.Task(CInt(RequiredArg(args, 0)),
                                  CInt(RequiredArg(args, 1)),
                                  CInt(RequiredArg(args, 2))));
       }},
      {kNamedOnly, names::kClearTask, CallKind::kMethod,
       [](kelReporterApi& self, Args&) {
         self.ClearTask();
         return kNoResult;
       }},
      {kNamedOnly, names::kComponentCount, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.ComponentCount(CInt(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kComponent, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.Component(CStr(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kTotalClassCount, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.TotalClassCount(CInt(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kClassCount, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.ClassCount(CInt(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kClass, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.Class(CStr(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kTotalMemberCount, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.TotalMemberCount(CInt(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kMemberCount, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.MemberCount(CInt(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kMember, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.Member(CStr(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kLog, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.Log(CStr(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kSummary, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         self.Summary(CStr(RequiredArg(args, 0)));
         return kNoResult;
       }},
      {kNamedOnly, names::kWarning, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         return WithTextByReference(
             args, [&self](std::string& text) { self.Warning(text); });
       }},
      {kNamedOnly, names::kError, CallKind::kMethod,
       [](kelReporterApi& self, Args& args) {
         return WithTextByReference(
             args, [&self](std::string& text) { self.Error(text); });
       }},
      {kNamedOnly, names::kWarningCount, CallKind::kMethod,
       [](kelReporterApi& self, Args&) {
         return Variant(self.WarningCount());
       }},
      {kNamedOnly, names::kErrorCount, CallKind::kMethod,
       [](kelReporterApi& self, Args&) { return Variant(self.ErrorCount()); }},
      {kNamedOnly, names::kClearStatusCounts, CallKind::kMethod,
       [](kelReporterApi& self, Args&) {
         self.ClearStatusCounts();
         return kNoResult;
       }},
      {kNamedOnly, names::kClearStatus, CallKind::kMethod,
       [](kelReporterApi& self, Args&) {
         self.ClearStatus();
         return kNoResult;
       }},
      {kNamedOnly, names::kInformationType, CallKind::kPropertyPut,
       [](kelReporterApi& self, Args& args) {
         self.SetInformationType(automation::CLng(automation::PutValue(args)));
         return kNoResult;
       }},
      {kNamedOnly, names::kInformationType, CallKind::kPropertyGet,
       [](kelReporterApi& self, Args&) {
         return Variant(self.InformationType());
       }},
  };
  return rows;
}

automation::Object ReporterObject(
    const std::shared_ptr<kelReporterApi>& reporter) {
  if (!reporter) return nullptr;
  auto object = std::dynamic_pointer_cast<automation::Dispatch>(reporter);
  if (!object) throw automation::Error(automation::kTypeMismatch);
  return object;
}

std::shared_ptr<kelReporterApi> ReporterOf(const automation::Variant& value) {
  automation::Object object = automation::CObj(value);
  if (!object) return nullptr;
  auto reporter = std::dynamic_pointer_cast<kelReporterApi>(object);
  if (!reporter) throw automation::Error(automation::kTypeMismatch);
  return reporter;
}

}  // namespace kelqln
