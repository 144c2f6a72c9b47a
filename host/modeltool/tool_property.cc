#include "host/modeltool/tool_property.h"

#include <utility>

#include "external/orel.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace names = external::orel::tool_property;

ToolProperty::ToolProperty(std::string tool, std::string name,
                           std::string value, std::string type)
    : tool_(std::move(tool)),
      name_(std::move(name)),
      value_(std::move(value)),
      type_(std::move(type)) {}

const automation::MemberTable<ToolProperty>& ToolProperty::Members() {
  static const automation::MemberTable<ToolProperty> table(
      "ToolProperty",
      {
          {names::kTool, "Tool", CallKind::kPropertyGet,
           [](ToolProperty& self, Args&) { return Variant(self.tool_); }},
          {names::kName, "Name", CallKind::kPropertyGet,
           [](ToolProperty& self, Args&) { return Variant(self.name_); }},
          {names::kValue, "Value", CallKind::kPropertyGet,
           [](ToolProperty& self, Args&) { return Variant(self.value_); }},
          {names::kValue, "Value", CallKind::kPropertyPut,
           [](ToolProperty& self, Args& args) {
             self.value_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
          {names::kType, "Type", CallKind::kPropertyGet,
           [](ToolProperty& self, Args&) { return Variant(self.type_); }},
      });
  return table;
}

}  // namespace host::modeltool
