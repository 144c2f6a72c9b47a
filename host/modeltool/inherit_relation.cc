#include "host/modeltool/inherit_relation.h"

#include "external/orel.h"
#include "host/modeltool/class.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

const char* InheritRelation::KindName() const {
  return orel::kind::kInheritRelation;
}

const automation::MemberTable<InheritRelation>& InheritRelation::Members() {
  static const automation::MemberTable<InheritRelation> table(
      "InheritRelation",
      WithElementMembers({
          {orel::owner::kOfInheritRelation, "OwnerClass", CallKind::kMethod,
           [](InheritRelation& self, Args&) {
             return Variant(self.ContextClass());
           }},
          {automation::kNamedOnly, "SupplierClass", CallKind::kPropertyGet,
           [](InheritRelation& self, Args&) {
             return Variant(self.Supplier());
           }},
          {automation::kNamedOnly, "SupplierName", CallKind::kPropertyGet,
           [](InheritRelation& self, Args&) {
             return Variant(self.SupplierName());
           }},
      }));
  return table;
}

}  // namespace host::modeltool
