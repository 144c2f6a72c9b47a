#include "host/modeltool/attribute.h"

#include "external/orel.h"
#include "host/modeltool/class.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

const char* Attribute::KindName() const { return orel::kind::kAttribute; }

const automation::MemberTable<Attribute>& Attribute::Members() {
  static const automation::MemberTable<Attribute> table(
      "Attribute",
      WithElementMembers({
          {orel::owner::kOfAttribute, "OwnerClass", CallKind::kMethod,
           [](Attribute& self, Args&) { return Variant(self.ContextClass()); }},
          {automation::kNamedOnly, "Type", CallKind::kPropertyGet,
           [](Attribute& self, Args&) { return Variant(self.type_); }},
          {automation::kNamedOnly, "Type", CallKind::kPropertyPut,
           [](Attribute& self, Args& args) {
             self.type_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
          {automation::kNamedOnly, "InitialValue", CallKind::kPropertyGet,
           [](Attribute& self, Args&) { return Variant(self.initial_value_); }},
          {automation::kNamedOnly, "InitialValue", CallKind::kPropertyPut,
           [](Attribute& self, Args& args) {
             self.initial_value_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
      }));
  return table;
}

}  // namespace host::modeltool
