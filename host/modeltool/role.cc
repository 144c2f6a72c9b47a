#include "host/modeltool/role.h"

#include "external/orel.h"
#include "host/modeltool/association.h"
#include "host/modeltool/class.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

const char* Role::KindName() const { return orel::kind::kRole; }

std::shared_ptr<Class> Role::ContextClass() const {
  auto association = GetAssociation();
  return association ? association->OtherRole(*this)->GetClass() : nullptr;
}

const automation::MemberTable<Role>& Role::Members() {
  static const automation::MemberTable<Role> table(
      "Role",
      WithElementMembers({
          {orel::role::kAssociation, orel::role::kAssociationName,
           CallKind::kPropertyGet,
           [](Role& self, Args&) { return Variant(self.GetAssociation()); }},
          {automation::kNamedOnly, orel::role::kNavigable,
           CallKind::kPropertyGet,
           [](Role& self, Args&) { return Variant(self.navigable_); }},
          {automation::kNamedOnly, orel::role::kNavigable,
           CallKind::kPropertyPut,
           [](Role& self, Args& args) {
             self.navigable_ = automation::CBool(automation::PutValue(args));
             return Variant();
           }},
          {automation::kNamedOnly, orel::role::kClass, CallKind::kPropertyGet,
           [](Role& self, Args&) { return Variant(self.GetClass()); }},
          {orel::owner::kOfRole, "OwnerClass", CallKind::kMethod,
           [](Role& self, Args&) { return Variant(self.ContextClass()); }},
          {automation::kNamedOnly, "Cardinality", CallKind::kPropertyGet,
           [](Role& self, Args&) { return Variant(self.cardinality_); }},
          {automation::kNamedOnly, "Cardinality", CallKind::kPropertyPut,
           [](Role& self, Args& args) {
             self.cardinality_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
          {automation::kNamedOnly, "Aggregate", CallKind::kPropertyGet,
           [](Role& self, Args&) { return Variant(self.aggregate_); }},
          {automation::kNamedOnly, "Aggregate", CallKind::kPropertyPut,
           [](Role& self, Args& args) {
             self.aggregate_ = automation::CBool(automation::PutValue(args));
             return Variant();
           }},
      }));
  return table;
}

}  // namespace host::modeltool
