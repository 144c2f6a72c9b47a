#include "host/modeltool/application.h"

#include <utility>

#include "external/orel.h"
#include "host/modeltool/add_in_manager.h"
#include "host/modeltool/model.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

Application::Application() : add_ins_(std::make_shared<AddInManager>()) {}

std::shared_ptr<Application> Application::Create() {
  auto application = std::make_shared<Application>();
  application->SetCurrentModel(Model::Create());
  return application;
}

void Application::SetCurrentModel(std::shared_ptr<Model> model) {
  if (model) {
    model->application_ =
        std::static_pointer_cast<Application>(shared_from_this());
  }
  model_ = std::move(model);
}

std::shared_ptr<Model> Application::OpenModel(const std::string& path) {
  auto model = Model::Load(path);
  SetCurrentModel(model);
  return model;
}

void Application::Log(const std::string& line) {
  log_.push_back(line);
  if (sink_) sink_(line);
}

const automation::MemberTable<Application>& Application::Members() {
  static const automation::MemberTable<Application> table(
      "Application",
      {
          {orel::application::kCurrentModel, "CurrentModel",
           CallKind::kPropertyGet,
           [](Application& self, Args&) { return Variant(self.model_); }},
          {orel::application::kAddInManager, "AddInManager",
           CallKind::kPropertyGet,
           [](Application& self, Args&) { return Variant(self.add_ins_); }},
          {orel::application::kLog, "Log", CallKind::kMethod,
           [](Application& self, Args& args) {
             self.Log(automation::CStr(automation::RequiredArg(args, 0)));
             return Variant();
           }},
          {orel::application::kSaveDialogPending, "SaveDialogPending",
           CallKind::kPropertyGet,
           [](Application& self, Args&) {
             return Variant(self.save_dialog_pending_);
           }},
          {orel::application::kSaveDialogPending, "SaveDialogPending",
           CallKind::kPropertyPut,
           [](Application& self, Args& args) {
             self.save_dialog_pending_ =
                 automation::CBool(automation::PutValue(args));
             return Variant();
           }},
          {automation::kNamedOnly, orel::application::kGetMainWnd,
           CallKind::kMethod,
           [](Application& self, Args&) { return Variant(self.main_window_); }},
          {automation::kNamedOnly, "OpenModel", CallKind::kMethod,
           [](Application& self, Args& args) {
             return Variant(self.OpenModel(
                 automation::CStr(automation::RequiredArg(args, 0))));
           }},
      });
  return table;
}

}  // namespace host::modeltool
