// A project's code as read, with the look-ups the code view needs: its
// classes in one list (components in order, each one's classes in order)
// and the components and classes by name.
#ifndef KELQLN_HOST_CODEVIEW_PROJECT_CODE_H_
#define KELQLN_HOST_CODEVIEW_PROJECT_CODE_H_

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "host/codeview/code_model.h"

namespace host::codeview {

class ProjectCode {
 public:
  explicit ProjectCode(CodeProject code);
  // The class list points into the code it holds.
  ProjectCode(const ProjectCode&) = delete;
  ProjectCode& operator=(const ProjectCode&) = delete;

  const CodeProject& Code() const { return code_; }
  const std::vector<const CodeClass*>& Classes() const { return classes_; }

  // Positions in Classes(); names compare exactly.
  std::optional<size_t> FindClass(std::string_view name) const;
  // Nullopt when the code has no component of that name.
  std::optional<std::vector<size_t>> ClassesOf(
      std::string_view component) const;

 private:
  struct Range {
    size_t first;
    size_t count;
  };

  CodeProject code_;
  std::vector<const CodeClass*> classes_;
  std::unordered_map<std::string, size_t> class_by_name_;
  std::unordered_map<std::string, Range> component_by_name_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_PROJECT_CODE_H_
