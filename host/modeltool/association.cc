#include "host/modeltool/association.h"

#include "external/orel.h"
#include "host/modeltool/role.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

std::shared_ptr<Role> Association::OtherRole(const Role& role) const {
  return role1_.get() == &role ? role2_ : role1_;
}

const automation::MemberTable<Association>& Association::Members() {
  static const automation::MemberTable<Association> table(
      "Association",
      WithElementMembers({
          {orel::association::kRole1, orel::association::kRole1Name,
           CallKind::kPropertyGet,
           [](Association& self, Args&) { return Variant(self.role1_); }},
          {orel::association::kRole2, orel::association::kRole2Name,
           CallKind::kPropertyGet,
           [](Association& self, Args&) { return Variant(self.role2_); }},
      }));
  return table;
}

}  // namespace host::modeltool
