#include "host/modeltool/realize_relation.h"

#include "external/orel.h"
#include "host/modeltool/class.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

const char* RealizeRelation::KindName() const {
  return orel::kind::kRealizeRelation;
}

const automation::MemberTable<RealizeRelation>& RealizeRelation::Members() {
  static const automation::MemberTable<RealizeRelation> table(
      "RealizeRelation",
      WithElementMembers({
          {orel::owner::kOfRealizeRelation, "OwnerClass", CallKind::kMethod,
           [](RealizeRelation& self, Args&) {
             return Variant(self.ContextClass());
           }},
          {automation::kNamedOnly, "SupplierClass", CallKind::kPropertyGet,
           [](RealizeRelation& self, Args&) {
             return Variant(self.Supplier());
           }},
          {automation::kNamedOnly, "SupplierName", CallKind::kPropertyGet,
           [](RealizeRelation& self, Args&) {
             return Variant(self.SupplierName());
           }},
      }));
  return table;
}

}  // namespace host::modeltool
