#include "engine/model_update_engine_utilities.h"

#include <utility>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/error.h"
#include "entry/add_in_services.h"
#include "entry/debug_log.h"
#include "entry/run_globals.h"
#include "external/code_view.h"
#include "external/common_dialog.h"
#include "external/orel.h"
#include "reporting/reporter_api_dispatch.h"
#include "shared/string_utilities.h"

namespace kelqln {
namespace {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::Object;
using automation::Variant;
namespace orel = external::orel;
namespace code_view = external::code_view;
namespace dialog = external::common_dialog;

// Texts of the backup's save dialog.
constexpr int32_t kSaveDialogTitle = 31000;
constexpr int32_t kSaveDialogFilter = 31001;

// Every round-trip language add-in's server under the add-in's name.
std::shared_ptr<AddInHandlerCollection> WalkRoundTripAddIns(
    const Object& application) {
  auto handlers = std::make_shared<AddInHandlerCollection>();
  Object add_ins = automation::GetObject(
      automation::GetObject(application, orel::application::kAddInManager),
      orel::add_in_manager::kAddIns);
  int32_t count =
      automation::CLng(automation::Get(add_ins, orel::collection::kCount));
  for (int32_t i = 1; i <= count; ++i) {
    Object add_in = automation::GetObject(add_ins, orel::collection::kGetAt, i);
    std::string name = CStr(automation::Get(add_in, orel::add_in::kName));
    if (!IsRTEAddIn(application, name, "")) continue;
    Object server = GetAddInServer(application, name, "");
    if (server) handlers->Add(std::move(server), std::move(name));
  }
  return handlers;
}

}  // namespace

Object GetLanguageAddIn(std::string_view name) {
  if (!GetAddInHandlers()) SetAddInHandlers(WalkRoundTripAddIns(GetOrelApp()));
  return GetAddInHandlers()->Item(std::string(name));
}

Object GetCodeViewProject(const Object& theOrelApp, std::string_view language,
                          Object& component,
                          std::shared_ptr<kelReporterApi>& reporter) {
  try {
    Object server = GetRTEServerOf(GetAddInServer(theOrelApp, language, ""));
    Args args{Variant(component), Variant(ReporterObject(reporter))};
    Object project = automation::CObj(automation::InvokeByName(
        server, code_view::rte_server::kCodeViewProject, CallKind::kMethod,
        args));
    Object new_component = automation::CObj(args[0]);
    std::shared_ptr<kelReporterApi> new_reporter = ReporterOf(args[1]);
    component = std::move(new_component);
    reporter = std::move(new_reporter);
    return project;
  } catch (const automation::Error& error) {
    DebugLog("ERROR kelQLN.GetCodeViewProject(" + std::string(language) +
                 "): " + error.Description(),
             kDebugCategoryQln, kDebugLevelError);
    return nullptr;
  }
}

bool QueryStatementGenerator(Object& element) {
  try {
    std::string language =
        CStr(automation::Get(element, orel::component::kLanguage));
    Object server = GetRTEServerOf(GetLanguageAddIn(language));
    Object generator = automation::CObj(automation::GetByName(
        server, code_view::rte_server::kStatementGenerator));
    // (element, the element as a model item, mode, reporter, answer)
    Args args{Variant(element), Variant(element), Variant(int16_t{0}),
              Variant(nullptr), Variant(false)};
    automation::Invoke(generator, code_view::statement_generator::kProcess,
                       CallKind::kMethod, args);
    bool included = automation::CBool(args[4]);
    element = automation::CObj(args[0]);
    return included;
  } catch (const automation::Error&) {
    return false;
  }
}

void SaveModel(const Object& theOrelApp) {
  Object model =
      automation::GetObject(theOrelApp, orel::application::kCurrentModel);
  std::string path = CStr(automation::Get(model, orel::model::kFilePath));
  if (!IsBlank(path)) {
    automation::Call(model, orel::model::kSave);
    return;
  }
  SaveModelUnderChosenName(theOrelApp);
}

void SaveModelUnderChosenName(const Object& theOrelApp) {
  automation::Let(theOrelApp, orel::application::kSaveDialogPending, true);
  std::string file_name;
  ShowSaveDialog(
      file_name, StringResText(kSaveDialogFilter),
      StringResText(kSaveDialogTitle),
      automation::CallByName(theOrelApp, orel::application::kGetMainWnd));
  if (IsBlank(file_name)) return;
  automation::Call(
      automation::GetObject(theOrelApp, orel::application::kCurrentModel),
      orel::model::kSaveAs, file_name);
}

void ShowSaveDialog(std::string& fileName, const std::string& filter,
                    const Variant& title, const Variant& owner) {
  Object save_dialog;
  try {
    save_dialog = automation::CreateObject(dialog::kProgId);
  } catch (const automation::Error&) {
    return;  // no dialog component: the caller sees its name unchanged
  }
  if (!title.IsMissing()) {
    automation::LetByName(save_dialog, dialog::kDialogTitle, title);
  }
  if (!owner.IsMissing()) {
    automation::LetByName(save_dialog, dialog::kParentWindow, owner);
  }
  if (!fileName.empty()) {
    automation::LetByName(save_dialog, dialog::kFileName, fileName);
  }
  automation::LetByName(save_dialog, dialog::kFilter, filter);
  automation::CallByName(save_dialog, dialog::kShowSave);
  fileName = CStr(automation::GetByName(save_dialog, dialog::kFileName));
}

}  // namespace kelqln
