// A package of components: the model's component tree. The model has one
// root package; packages nest.
#ifndef KELQLN_HOST_MODELTOOL_COMPONENT_PACKAGE_H_
#define KELQLN_HOST_MODELTOOL_COMPONENT_PACKAGE_H_

#include <memory>
#include <string>
#include <vector>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Component;

class ComponentPackage : public ElementImpl<ComponentPackage> {
 public:
  // Made by the model (the root) or by NewPackage.
  explicit ComponentPackage(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<ComponentPackage>& Members();
  const char* KindName() const override { return "ComponentPackage"; }

  // A new component of this package; `unique_id` "" takes a new one.
  std::shared_ptr<Component> NewComponent(std::string name,
                                          const std::string& unique_id = "");
  std::shared_ptr<ComponentPackage> NewPackage(
      std::string name, const std::string& unique_id = "");
  // Deletes a component of this package with everything that hangs on it
  // (class assignments, its dependencies and those on it, the selection);
  // false when it is not this package's.
  bool DeleteComponent(std::shared_ptr<Component> component);

  const std::vector<std::shared_ptr<Component>>& Components() const {
    return components_;
  }
  const std::vector<std::shared_ptr<ComponentPackage>>& Packages() const {
    return packages_;
  }
  // The enclosing package; nullptr for the root.
  std::shared_ptr<ComponentPackage> Parent() const { return parent_.lock(); }

  bool IsModifiable() const { return modifiable_; }
  void SetModifiable(bool modifiable) { modifiable_ = modifiable; }

 private:
  friend class Model;
  std::weak_ptr<ComponentPackage> parent_;
  std::vector<std::shared_ptr<Component>> components_;
  std::vector<std::shared_ptr<ComponentPackage>> packages_;
  bool modifiable_ = true;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_COMPONENT_PACKAGE_H_
