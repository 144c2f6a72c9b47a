#include "host/modeltool/dependency.h"

#include "external/orel.h"
#include "host/modeltool/component.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

const automation::MemberTable<Dependency>& Dependency::Members() {
  static const automation::MemberTable<Dependency> table(
      "Dependency",
      WithElementMembers({
          {orel::dependency::kIsComponentDependency, "IsComponentDependency",
           CallKind::kPropertyGet,
           [](Dependency& self, Args&) {
             return Variant(self.IsComponentDependency());
           }},
          {orel::dependency::kSupplier, "Supplier", CallKind::kMethod,
           [](Dependency& self, Args&) { return Variant(self.Supplier()); }},
          {automation::kNamedOnly, "Client", CallKind::kMethod,
           [](Dependency& self, Args&) { return Variant(self.Client()); }},
      }));
  return table;
}

}  // namespace host::modeltool
