#include "host/dialogs/common_dialog.h"

#include <deque>
#include <memory>
#include <utility>

#include "automation/class_registry.h"
#include "external/common_dialog.h"

namespace host::dialogs {
namespace {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::kNamedOnly;
using automation::PutValue;
using automation::Variant;
namespace names = external::common_dialog;

struct SaveDialogs {
  std::deque<std::string> answers;
  std::vector<SaveDialogShown> shown;
};

SaveDialogs& State() {
  static auto* state = new SaveDialogs;  // outlives static teardown
  return *state;
}

}  // namespace

const automation::MemberTable<CommonDialog>& CommonDialog::Members() {
  static const automation::MemberTable<CommonDialog> table(
      "CommonDialog",
      {
          {kNamedOnly, names::kDialogTitle, CallKind::kPropertyGet,
           [](CommonDialog& self, Args&) {
             return Variant(self.dialog_title_);
           }},
          {kNamedOnly, names::kDialogTitle, CallKind::kPropertyPut,
           [](CommonDialog& self, Args& args) {
             self.dialog_title_ = CStr(PutValue(args));
             return Variant();
           }},
          {kNamedOnly, names::kParentWindow, CallKind::kPropertyGet,
           [](CommonDialog& self, Args&) { return self.parent_window_; }},
          {kNamedOnly, names::kParentWindow, CallKind::kPropertyPut,
           [](CommonDialog& self, Args& args) {
             self.parent_window_ = PutValue(args);
             return Variant();
           }},
          {kNamedOnly, names::kFileName, CallKind::kPropertyGet,
           [](CommonDialog& self, Args&) { return Variant(self.file_name_); }},
          {kNamedOnly, names::kFileName, CallKind::kPropertyPut,
           [](CommonDialog& self, Args& args) {
             self.file_name_ = CStr(PutValue(args));
             return Variant();
           }},
          {kNamedOnly, names::kFilter, CallKind::kPropertyGet,
           [](CommonDialog& self, Args&) { return Variant(self.filter_); }},
          {kNamedOnly, names::kFilter, CallKind::kPropertyPut,
           [](CommonDialog& self, Args& args) {
             self.filter_ = CStr(PutValue(args));
             return Variant();
           }},
          {kNamedOnly, names::kShowSave, CallKind::kMethod,
           [](CommonDialog& self, Args&) {
             self.ShowSave();
             return Variant();
           }},
      });
  return table;
}

void CommonDialog::ShowSave() {
  SaveDialogs& state = State();
  state.shown.push_back({dialog_title_, parent_window_, file_name_, filter_});
  file_name_.clear();
  if (!state.answers.empty()) {
    file_name_ = std::move(state.answers.front());
    state.answers.pop_front();
  }
}

void RegisterCommonDialog() {
  automation::RegisterClass(names::kProgId, "",
                            [] { return std::make_shared<CommonDialog>(); });
}

void PresetSaveAnswers(std::vector<std::string> answers) {
  for (std::string& answer : answers) {
    State().answers.push_back(std::move(answer));
  }
}

std::vector<SaveDialogShown> ShownSaveDialogs() { return State().shown; }

void ResetSaveDialogs() { State() = SaveDialogs(); }

}  // namespace host::dialogs
