#include "host/modeltool/parameter.h"

#include "host/modeltool/operation.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;

const automation::MemberTable<Parameter>& Parameter::Members() {
  static const automation::MemberTable<Parameter> table(
      "Parameter",
      WithElementMembers({
          {automation::kNamedOnly, "Type", CallKind::kPropertyGet,
           [](Parameter& self, Args&) { return Variant(self.type_); }},
          {automation::kNamedOnly, "Type", CallKind::kPropertyPut,
           [](Parameter& self, Args& args) {
             self.type_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
          {automation::kNamedOnly, "DefaultValue", CallKind::kPropertyGet,
           [](Parameter& self, Args&) { return Variant(self.default_value_); }},
          {automation::kNamedOnly, "DefaultValue", CallKind::kPropertyPut,
           [](Parameter& self, Args& args) {
             self.default_value_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
          {automation::kNamedOnly, "Operation", CallKind::kPropertyGet,
           [](Parameter& self, Args&) { return Variant(self.GetOperation()); }},
      }));
  return table;
}

}  // namespace host::modeltool
