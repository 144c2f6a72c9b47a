#include "host/cli/element_summary.h"

#include <memory>

#include "host/modeltool/class.h"
#include "host/modeltool/class_relation.h"
#include "host/modeltool/component.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/role.h"

namespace host::cli {
namespace {

std::string OwnerOf(const modeltool::Element& element) {
  if (auto owner = element.ContextClass()) return owner->Name();
  if (auto cls = dynamic_cast<const modeltool::Class*>(&element)) {
    for (const auto& component : cls->Components()) {
      if (auto locked = component.lock()) return locked->Name();
    }
    if (auto package = cls->Package()) return package->Name();
  }
  return "";
}

std::string NameOf(const modeltool::Element& element) {
  if (!element.Name().empty()) return element.Name();
  if (auto relation = dynamic_cast<const modeltool::ClassRelation*>(&element)) {
    return relation->SupplierName();
  }
  if (auto role = dynamic_cast<const modeltool::Role*>(&element)) {
    if (auto cls = role->GetClass()) return cls->Name();
  }
  return "";
}

}  // namespace

ElementSummary ElementSummary::Of(const modeltool::Element& element) {
  return {element.KindName(), OwnerOf(element), NameOf(element),
          element.UniqueId()};
}

}  // namespace host::cli
