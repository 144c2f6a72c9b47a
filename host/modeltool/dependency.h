// A dependency of a component (the client) on another (the supplier); with
// the stereotype "Implements" it says that the client implements the
// supplier.
#ifndef KELQLN_HOST_MODELTOOL_DEPENDENCY_H_
#define KELQLN_HOST_MODELTOOL_DEPENDENCY_H_

#include <memory>
#include <string>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Component;

class Dependency : public ElementImpl<Dependency> {
 public:
  // Made by Component::NewDependency.
  explicit Dependency(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<Dependency>& Members();
  const char* KindName() const override { return "Dependency"; }

  std::shared_ptr<Component> Client() const { return client_.lock(); }
  std::shared_ptr<Component> Supplier() const { return supplier_.lock(); }
  // True for a dependency between components (the only kind made here).
  bool IsComponentDependency() const { return true; }

 private:
  friend class Component;
  friend class Model;
  std::weak_ptr<Component> client_;
  std::weak_ptr<Component> supplier_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_DEPENDENCY_H_
