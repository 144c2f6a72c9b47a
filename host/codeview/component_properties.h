// What the "VC++" add-in answers to "CompPropertiesAPI": member
// "ProjectFile"(component) gives the path of the component's project file
// (project_file.h), "" when it names none.
#ifndef KELQLN_HOST_CODEVIEW_COMPONENT_PROPERTIES_H_
#define KELQLN_HOST_CODEVIEW_COMPONENT_PROPERTIES_H_

#include <string>

#include "automation/member_table.h"

namespace host::codeview {

class ComponentProperties
    : public automation::DispatchImpl<ComponentProperties> {
 public:
  // `tool` is the tool name of the "ProjectFile" property.
  explicit ComponentProperties(std::string tool);

  static const automation::MemberTable<ComponentProperties>& Members();

 private:
  std::string tool_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_COMPONENT_PROPERTIES_H_
