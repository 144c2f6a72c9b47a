#include "host/codeview/element_index.h"

#include <utility>

#include "external/code_view.h"
#include "host/codeview/code_view_class.h"
#include "host/codeview/code_view_component.h"
#include "host/codeview/code_view_project.h"

namespace host::codeview {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::OptionalArg;
using automation::RequiredArg;
using automation::Variant;

ElementIndex::ElementIndex(std::shared_ptr<CodeViewProject> project)
    : project_(std::move(project)) {}

automation::Object ElementIndex::Find(const std::string& name,
                                      const std::string& unique_id) const {
  const ProjectCode* code = project_->Code();
  if (!code) return nullptr;
  if (!unique_id.empty()) {
    for (size_t i = 0; i < code->Classes().size(); ++i) {
      if (project_->ClassUniqueId(i) == unique_id) {
        return project_->ClassObject(code->Classes()[i]->name);
      }
    }
  }
  if (code->FindClass(name)) return project_->ClassObject(name);
  if (code->ClassesOf(name)) return project_->ComponentObject(name);
  return nullptr;
}

const automation::MemberTable<ElementIndex>& ElementIndex::Members() {
  static const automation::MemberTable<ElementIndex> table(
      "ElementIndex",
      {
          {external::code_view::element_index::kFind, "Find", CallKind::kMethod,
           [](ElementIndex& self, Args& args) {
             return Variant(self.Find(CStr(RequiredArg(args, 0)),
                                      CStr(OptionalArg(args, 1, ""))));
           }},
      });
  return table;
}

}  // namespace host::codeview
