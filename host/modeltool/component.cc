#include "host/modeltool/component.h"

#include <algorithm>
#include <utility>

#include "automation/error.h"
#include "external/orel.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/dependency.h"
#include "host/modeltool/element_collection.h"
#include "host/modeltool/model.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

const char* Component::KindName() const { return orel::kind::kComponent; }

std::string Component::DisplayName() const {
  std::string name = Name();
  for (auto package = Package(); package && package->Parent();
       package = package->Parent()) {
    name = package->Name() + "::" + name;
  }
  return name;
}

std::shared_ptr<Dependency> Component::NewDependency(
    const std::shared_ptr<Component>& supplier, std::string name,
    const std::string& unique_id) {
  auto model = RequireModel();
  if (!supplier || supplier->GetModel() != model) {
    throw automation::Error(
        automation::kInvalidProcedureCall,
        "A dependency's supplier is a component of the same model");
  }
  auto dependency = std::make_shared<Dependency>(std::move(name));
  model->Register(*dependency, unique_id);
  dependency->client_ = Self();
  dependency->supplier_ = supplier;
  dependencies_.push_back(dependency);
  supplier->dependents_.push_back(dependency);
  return dependency;
}

bool Component::DeleteDependency(std::shared_ptr<Dependency> dependency) {
  auto at = std::find(dependencies_.begin(), dependencies_.end(), dependency);
  if (!dependency || at == dependencies_.end()) return false;
  dependencies_.erase(at);
  if (auto supplier = dependency->Supplier()) {
    std::erase_if(supplier->dependents_, [&](const auto& weak) {
      return weak.expired() || weak.lock() == dependency;
    });
  }
  if (auto model = GetModel()) model->Forget(*dependency);
  return true;
}

const automation::MemberTable<Component>& Component::Members() {
  static const automation::MemberTable<Component> table(
      "Component",
      WithElementMembers({
          {orel::component::kLanguage, "Language", CallKind::kPropertyGet,
           [](Component& self, Args&) { return Variant(self.language_); }},
          {orel::component::kLanguage, "Language", CallKind::kPropertyPut,
           [](Component& self, Args& args) {
             self.language_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
          {orel::component::kClasses, "Classes", CallKind::kMethod,
           [](Component& self, Args&) {
             return Variant(ElementCollection<Class, std::weak_ptr<Class>>::Of(
                 self.Self(), self.classes_));
           }},
          {orel::component::kModel, "Model", CallKind::kPropertyGet,
           [](Component& self, Args&) { return Variant(self.GetModel()); }},
          {orel::component::kComponentPackage, "Package",
           CallKind::kPropertyGet,
           [](Component& self, Args&) { return Variant(self.Package()); }},
          {orel::component::kDependencies, "Dependencies", CallKind::kMethod,
           [](Component& self, Args&) {
             return Variant(ElementCollection<Dependency>::Of(
                 self.Self(), self.dependencies_));
           }},
          {orel::component::kDisplayName, "DisplayName", CallKind::kPropertyGet,
           [](Component& self, Args&) { return Variant(self.DisplayName()); }},
      }));
  return table;
}

}  // namespace host::modeltool
