#include "host/codeview/component_properties.h"

#include <utility>

#include "external/code_view.h"
#include "host/codeview/project_file.h"
#include "host/modeltool/element.h"

namespace host::codeview {

using automation::Args;
using automation::CallKind;
using automation::Variant;

ComponentProperties::ComponentProperties(std::string tool)
    : tool_(std::move(tool)) {}

const automation::MemberTable<ComponentProperties>&
ComponentProperties::Members() {
  static const automation::MemberTable<ComponentProperties> table(
      "ComponentProperties",
      {
          {automation::kNamedOnly,
           external::code_view::comp_properties::kProjectFile,
           CallKind::kMethod,
           [](ComponentProperties& self, Args& args) {
             auto component = modeltool::ElementArg<modeltool::Component>(
                 automation::RequiredArg(args, 0));
             if (!component) {
               throw automation::Error(
                   automation::kTypeMismatch,
                   "ProjectFile takes a component of the modelling tool");
             }
             return Variant(ProjectFileOf(*component, self.tool_));
           }},
      });
  return table;
}

}  // namespace host::codeview
