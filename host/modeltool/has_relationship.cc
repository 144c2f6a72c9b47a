#include "host/modeltool/has_relationship.h"

#include "external/orel.h"
#include "host/modeltool/class.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

const char* HasRelationship::KindName() const {
  return orel::kind::kHasRelationship;
}

const automation::MemberTable<HasRelationship>& HasRelationship::Members() {
  static const automation::MemberTable<HasRelationship> table(
      "HasRelationship",
      WithElementMembers({
          {orel::owner::kOfHasRelationship, "OwnerClass", CallKind::kMethod,
           [](HasRelationship& self, Args&) {
             return Variant(self.ContextClass());
           }},
          {automation::kNamedOnly, "SupplierClass", CallKind::kPropertyGet,
           [](HasRelationship& self, Args&) {
             return Variant(self.Supplier());
           }},
          {automation::kNamedOnly, "SupplierName", CallKind::kPropertyGet,
           [](HasRelationship& self, Args&) {
             return Variant(self.SupplierName());
           }},
      }));
  return table;
}

}  // namespace host::modeltool
