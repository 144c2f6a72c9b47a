#include "entry/run_globals.h"

#include <utility>

#include "automation/call.h"
#include "external/string_service.h"

namespace kelqln {
namespace {

struct RunGlobals {
  automation::Object string_res;
  automation::Object orel_app;
  automation::Object orel_model;
  automation::Object orel_vs_add_in;
  std::string root_registry_path;
  std::shared_ptr<kelModelUpdateEngine> model_update_engine;
  std::shared_ptr<API> quillon_api;
  std::shared_ptr<kelSortedCVProjects> selected_code_items;
  std::shared_ptr<kelSortedComponents> selected_orel_items;
  bool silent_run = false;
  std::shared_ptr<AddInHandlerCollection> add_in_handlers;
};

RunGlobals& Globals() {
  static RunGlobals* globals = new RunGlobals;  // outlives static teardown
  return *globals;
}

}  // namespace

automation::Object GetStringRes() { return Globals().string_res; }
void SetStringRes(automation::Object value) {
  Globals().string_res = std::move(value);
}

automation::Object GetOrelApp() { return Globals().orel_app; }
void SetOrelApp(automation::Object value) {
  Globals().orel_app = std::move(value);
}

automation::Object GetOrelModel() { return Globals().orel_model; }
void SetOrelModel(automation::Object value) {
  Globals().orel_model = std::move(value);
}

automation::Object GetOrelVSAddIn() { return Globals().orel_vs_add_in; }
void SetOrelVSAddIn(automation::Object value) {
  Globals().orel_vs_add_in = std::move(value);
}

const std::string& GetOrelVSAddInRootRegistryPath() {
  return Globals().root_registry_path;
}
void SetOrelVSAddInRootRegistryPath(std::string value) {
  Globals().root_registry_path = std::move(value);
}

std::shared_ptr<kelModelUpdateEngine> GetModelUpdateEngine() {
  return Globals().model_update_engine;
}
void SetModelUpdateEngine(std::shared_ptr<kelModelUpdateEngine> value) {
  Globals().model_update_engine = std::move(value);
}

std::shared_ptr<API> GetQuillonAPI() { return Globals().quillon_api; }
void SetQuillonAPI(std::shared_ptr<API> value) {
  Globals().quillon_api = std::move(value);
}

std::shared_ptr<kelSortedCVProjects> GetSelectedCodeItems() {
  return Globals().selected_code_items;
}
void SetSelectedCodeItems(std::shared_ptr<kelSortedCVProjects> value) {
  Globals().selected_code_items = std::move(value);
}

std::shared_ptr<kelSortedComponents> GetSelectedOrelItems() {
  return Globals().selected_orel_items;
}
void SetSelectedOrelItems(std::shared_ptr<kelSortedComponents> value) {
  Globals().selected_orel_items = std::move(value);
}

bool GetSilentRun() { return Globals().silent_run; }
void SetSilentRun(bool value) { Globals().silent_run = value; }

std::shared_ptr<AddInHandlerCollection> GetAddInHandlers() {
  return Globals().add_in_handlers;
}
void SetAddInHandlers(std::shared_ptr<AddInHandlerCollection> value) {
  Globals().add_in_handlers = std::move(value);
}

std::string StringResText(int32_t number) {
  return automation::CStr(automation::Call(
      GetStringRes(), external::string_service::kText, number));
}

void ResetRunGlobals() {
  // Moved out first: releasing one object may call back into the globals.
  RunGlobals old = std::move(Globals());
  Globals() = RunGlobals();
}

}  // namespace kelqln
