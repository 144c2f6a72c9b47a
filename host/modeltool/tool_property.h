// A tool property of a model element: a value kept for a tool (e.g. the
// value "Kind" of the tool "VC++"), with a type name ("String", "Boolean").
#ifndef KELQLN_HOST_MODELTOOL_TOOL_PROPERTY_H_
#define KELQLN_HOST_MODELTOOL_TOOL_PROPERTY_H_

#include <string>

#include "automation/member_table.h"

namespace host::modeltool {

class ToolProperty : public automation::DispatchImpl<ToolProperty> {
 public:
  ToolProperty(std::string tool, std::string name, std::string value,
               std::string type);

  static const automation::MemberTable<ToolProperty>& Members();

  const std::string& Tool() const { return tool_; }
  const std::string& Name() const { return name_; }
  const std::string& Value() const { return value_; }
  void SetValue(std::string value) { value_ = std::move(value); }
  const std::string& Type() const { return type_; }
  void SetType(std::string type) { type_ = std::move(type); }

 private:
  std::string tool_;
  std::string name_;
  std::string value_;
  std::string type_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_TOOL_PROPERTY_H_
