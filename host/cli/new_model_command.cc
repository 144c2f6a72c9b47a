#include "host/cli/new_model_command.h"

#include <filesystem>
#include <ostream>
#include <system_error>

#include "host/cli/exit_code.h"
#include "host/cli/file_lookup.h"
#include "host/cli/usage_error.h"
#include "host/modeltool/add_in_registry.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/model.h"
#include "platform/registry.h"

namespace host::cli {
namespace {

namespace fs = std::filesystem;

void RequireLanguageAddIn(const std::string& language) {
  std::string installed;
  for (const auto& add_in : modeltool::ReadAddInDescriptions()) {
    if (!add_in.language_add_in) continue;
    if (add_in.name == language) return;
    installed += (installed.empty() ? "" : ", ") + add_in.name;
  }
  throw UsageError("--language " + language +
                   ": no language add-in of that name is installed (" +
                   (installed.empty() ? "none is" : "installed: " + installed) +
                   ")");
}

std::string FromModelDirectory(const std::string& project,
                               const std::string& model) {
  if (fs::path(project).is_absolute()) return project;
  fs::path directory = fs::absolute(model).parent_path().lexically_normal();
  return fs::absolute(project)
      .lexically_normal()
      .lexically_relative(directory)
      .string();
}

}  // namespace

int RunNewModel(const NewModelOptions& options, std::ostream& out) {
  std::error_code error;
  if (fs::exists(options.model, error)) {
    throw UsageError(options.model + ": the file exists already");
  }
  platform::UseRegistryFile(FindRegistryFile(options.registry));
  RequireLanguageAddIn(options.language);

  auto model = modeltool::Model::Create();
  model->SetName(fs::path(options.model).stem().string());
  model->SetDefaultLanguage(options.language);
  auto component =
      model->RootComponentPackage()->NewComponent(options.component);
  component->SetLanguage(options.language);
  std::string project = FromModelDirectory(options.project, options.model);
  component->OverrideToolProperty(options.language, "ProjectFile", project);
  model->SaveAs(options.model);
  out << "Created " << options.model << ": component " << options.component
      << " (" << options.language << ", project " << project << ").\n";
  return kDone;
}

}  // namespace host::cli
