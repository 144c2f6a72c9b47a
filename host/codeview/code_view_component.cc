#include "host/codeview/code_view_component.h"

#include <utility>

#include "external/code_view.h"
#include "host/codeview/code_view_project.h"

namespace host::codeview {

using automation::Args;
using automation::CallKind;
using automation::OptionalArg;
using automation::RequiredArg;
using automation::Variant;
namespace component = external::code_view::component;

CodeViewComponent::CodeViewComponent(std::shared_ptr<CodeViewProject> project,
                                     std::string name)
    : project_(std::move(project)), name_(std::move(name)) {}

const automation::MemberTable<CodeViewComponent>& CodeViewComponent::Members() {
  static const automation::MemberTable<CodeViewComponent> table(
      "CodeViewComponent",
      {
          {component::kProject, "Project", CallKind::kPropertyGet,
           [](CodeViewComponent& self, Args&) {
             return Variant(self.project_);
           }},
          {component::kName, "Name", CallKind::kPropertyGet,
           [](CodeViewComponent& self, Args&) { return Variant(self.name_); }},
          {component::kUpdateModel, "UpdateModel", CallKind::kMethod,
           [](CodeViewComponent& self, Args& args) {
             self.project_->UpdateComponent(self.name_, RequiredArg(args, 0),
                                            ReporterLink(OptionalArg(args, 1)),
                                            RequiredArg(args, 2));
             return Variant();
           }},
      });
  return table;
}

}  // namespace host::codeview
