#include "host/codeview/project_file.h"

#include <filesystem>

#include "host/modeltool/model.h"
#include "shared/string_utilities.h"

namespace host::codeview {

std::string ProjectFileOf(const modeltool::Component& component,
                          const std::string& tool) {
  namespace fs = std::filesystem;
  std::string value =
      kelqln::Trim(component.ToolPropertyValue(tool, kProjectFileProperty));
  if (value.empty()) return "";
  fs::path path(value);
  if (path.is_relative()) {
    auto model = component.GetModel();
    if (model && !model->FilePath().empty()) {
      path = fs::path(model->FilePath()).parent_path() / path;
    }
  }
  return path.lexically_normal().string();
}

}  // namespace host::codeview
