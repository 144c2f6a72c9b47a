#include "host/codeview/code_view_class.h"

#include <utility>

#include "external/code_view.h"
#include "host/codeview/code_view_component.h"
#include "host/codeview/code_view_project.h"

namespace host::codeview {

using automation::Args;
using automation::CallKind;
using automation::OptionalArg;
using automation::RequiredArg;
using automation::Variant;
namespace component = external::code_view::component;

CodeViewClass::CodeViewClass(std::shared_ptr<CodeViewProject> project,
                             std::string name)
    : project_(std::move(project)), name_(std::move(name)) {}

std::string CodeViewClass::UniqueId() const {
  const ProjectCode* code = project_->Code();
  auto index = code ? code->FindClass(name_) : std::nullopt;
  return index ? project_->ClassUniqueId(*index) : "";
}

automation::Object CodeViewClass::Component() const {
  std::string name = project_->ComponentOfClass(name_);
  if (name.empty()) return nullptr;
  return project_->ComponentObject(name);
}

const automation::MemberTable<CodeViewClass>& CodeViewClass::Members() {
  static const automation::MemberTable<CodeViewClass> table(
      "CodeViewClass",
      {
          {component::kProject, "Project", CallKind::kPropertyGet,
           [](CodeViewClass& self, Args&) { return Variant(self.project_); }},
          {component::kName, "Name", CallKind::kPropertyGet,
           [](CodeViewClass& self, Args&) { return Variant(self.name_); }},
          {external::code_view::project::kUniqueId, "UniqueID",
           CallKind::kPropertyGet,
           [](CodeViewClass& self, Args&) { return Variant(self.UniqueId()); }},
          {automation::kNamedOnly, "Component", CallKind::kPropertyGet,
           [](CodeViewClass& self, Args&) {
             return Variant(self.Component());
           }},
          {component::kUpdateModel, "UpdateModel", CallKind::kMethod,
           [](CodeViewClass& self, Args& args) {
             self.project_->UpdateClass(self.name_, RequiredArg(args, 0),
                                        ReporterLink(OptionalArg(args, 1)),
                                        RequiredArg(args, 2));
             return Variant();
           }},
      });
  return table;
}

}  // namespace host::codeview
