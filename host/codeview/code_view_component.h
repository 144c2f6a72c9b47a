// A component of a code-view project: a unit of its code (a source file, a
// module) holding classes. Members: Project 1, Name 2, UpdateModel 7 (model,
// reporter, collector, flag), which updates the model classes of the
// component's classes (model_synchronizer.h).
#ifndef KELQLN_HOST_CODEVIEW_CODE_VIEW_COMPONENT_H_
#define KELQLN_HOST_CODEVIEW_CODE_VIEW_COMPONENT_H_

#include <memory>
#include <string>

#include "automation/member_table.h"

namespace host::codeview {

class CodeViewProject;

class CodeViewComponent : public automation::DispatchImpl<CodeViewComponent> {
 public:
  CodeViewComponent(std::shared_ptr<CodeViewProject> project, std::string name);

  static const automation::MemberTable<CodeViewComponent>& Members();

 private:
  std::shared_ptr<CodeViewProject> project_;
  std::string name_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_CODE_VIEW_COMPONENT_H_
