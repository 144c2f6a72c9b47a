#include "host/modeltool/component_package.h"

#include <algorithm>
#include <utility>

#include "external/orel.h"
#include "host/modeltool/component.h"
#include "host/modeltool/element_collection.h"
#include "host/modeltool/model.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

std::shared_ptr<Component> ComponentPackage::NewComponent(
    std::string name, const std::string& unique_id) {
  auto model = RequireModel();
  auto component = std::make_shared<Component>(std::move(name));
  model->Register(*component, unique_id);
  component->package_ = Self();
  components_.push_back(component);
  model->AddComponent(component);
  return component;
}

std::shared_ptr<ComponentPackage> ComponentPackage::NewPackage(
    std::string name, const std::string& unique_id) {
  auto model = RequireModel();
  auto package = std::make_shared<ComponentPackage>(std::move(name));
  model->Register(*package, unique_id);
  package->parent_ = Self();
  packages_.push_back(package);
  return package;
}

bool ComponentPackage::DeleteComponent(std::shared_ptr<Component> component) {
  if (!component || component->Package().get() != this) return false;
  RequireModel()->DestroyComponent(component);
  return true;
}

const automation::MemberTable<ComponentPackage>& ComponentPackage::Members() {
  static const automation::MemberTable<ComponentPackage> table(
      "ComponentPackage",
      WithElementMembers({
          {orel::component_package::kComponents, "Components",
           CallKind::kMethod,
           [](ComponentPackage& self, Args&) {
             return Variant(ElementCollection<Component>::Of(self.Self(),
                                                             self.components_));
           }},
          {orel::component_package::kNewComponent, "NewComponent",
           CallKind::kMethod,
           [](ComponentPackage& self, Args& args) {
             return Variant(self.NewComponent(
                 automation::CStr(automation::RequiredArg(args, 0))));
           }},
          {orel::component_package::kIsModifiable, "IsModifiable",
           CallKind::kPropertyGet,
           [](ComponentPackage& self, Args&) {
             return Variant(self.modifiable_);
           }},
          {orel::component_package::kIsModifiable, "IsModifiable",
           CallKind::kPropertyPut,
           [](ComponentPackage& self, Args& args) {
             self.modifiable_ = automation::CBool(automation::PutValue(args));
             return Variant();
           }},
          {automation::kNamedOnly, "Packages", CallKind::kPropertyGet,
           [](ComponentPackage& self, Args&) {
             return Variant(ElementCollection<ComponentPackage>::Of(
                 self.Self(), self.packages_));
           }},
          {automation::kNamedOnly, "ParentPackage", CallKind::kPropertyGet,
           [](ComponentPackage& self, Args&) {
             return Variant(self.Parent());
           }},
      }));
  return table;
}

}  // namespace host::modeltool
