// A component (kind "Module"): a unit of code in a language, to which
// classes are assigned (many to many) and which depends on other components.
#ifndef KELQLN_HOST_MODELTOOL_COMPONENT_H_
#define KELQLN_HOST_MODELTOOL_COMPONENT_H_

#include <memory>
#include <string>
#include <vector>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Class;
class ComponentPackage;
class Dependency;

class Component : public ElementImpl<Component> {
 public:
  // Made by ComponentPackage::NewComponent.
  explicit Component(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<Component>& Members();
  const char* KindName() const override;

  const std::string& Language() const { return language_; }
  void SetLanguage(std::string language) { language_ = std::move(language); }
  // The name qualified by the packages below the root ("Pkg::Name").
  std::string DisplayName() const;

  std::shared_ptr<ComponentPackage> Package() const { return package_.lock(); }
  // The assigned classes, in the order of assignment.
  const std::vector<std::weak_ptr<Class>>& Classes() const { return classes_; }

  // A new dependency of this component on `supplier` (of the same model).
  std::shared_ptr<Dependency> NewDependency(
      const std::shared_ptr<Component>& supplier, std::string name = "",
      const std::string& unique_id = "");
  // False when the dependency is not this component's.
  bool DeleteDependency(std::shared_ptr<Dependency> dependency);
  const std::vector<std::shared_ptr<Dependency>>& Dependencies() const {
    return dependencies_;
  }

 private:
  friend class Class;
  friend class ComponentPackage;
  friend class Dependency;
  friend class Model;
  friend class ModelReader;
  std::weak_ptr<ComponentPackage> package_;
  std::string language_;
  std::vector<std::weak_ptr<Class>> classes_;
  std::vector<std::shared_ptr<Dependency>> dependencies_;
  // Dependencies of other components on this one.
  std::vector<std::weak_ptr<Dependency>> dependents_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_COMPONENT_H_
