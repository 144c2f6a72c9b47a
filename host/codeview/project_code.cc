#include "host/codeview/project_code.h"

#include <utility>

namespace host::codeview {

ProjectCode::ProjectCode(CodeProject code) : code_(std::move(code)) {
  for (const CodeComponent& component : code_.components) {
    component_by_name_.emplace(
        component.name, Range{classes_.size(), component.classes.size()});
    for (const CodeClass& cls : component.classes) {
      class_by_name_.emplace(cls.name, classes_.size());
      classes_.push_back(&cls);
    }
  }
}

std::optional<size_t> ProjectCode::FindClass(std::string_view name) const {
  auto found = class_by_name_.find(std::string(name));
  if (found == class_by_name_.end()) return std::nullopt;
  return found->second;
}

std::optional<std::vector<size_t>> ProjectCode::ClassesOf(
    std::string_view component) const {
  auto found = component_by_name_.find(std::string(component));
  if (found == component_by_name_.end()) return std::nullopt;
  std::vector<size_t> positions(found->second.count);
  for (size_t i = 0; i < positions.size(); ++i) {
    positions[i] = found->second.first + i;
  }
  return positions;
}

}  // namespace host::codeview
