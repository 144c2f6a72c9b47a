#include "host/cli/tool_host.h"

#include "host/codeview/registration.h"
#include "host/dialogs/common_dialog.h"
#include "host/modeltool/add_in_registry.h"
#include "host/modeltool/application.h"
#include "host/modeltool/model.h"
#include "host/strings/string_service.h"
#include "platform/registry.h"

namespace host::cli {

ToolHost::ToolHost(const std::string& registry_file) {
  platform::UseRegistryFile(registry_file);
  strings::RegisterStringService();
  dialogs::RegisterCommonDialog();
  codeview::RegisterCodeViewClasses();
  app_ = modeltool::Application::Create();
  modeltool::LoadAddInsFromRegistry(*app_->AddIns());
}

std::shared_ptr<modeltool::Model> ToolHost::OpenModel(const std::string& path) {
  return app_->OpenModel(path);
}

}  // namespace host::cli
