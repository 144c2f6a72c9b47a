// Model::IntegrityProblems: the invariants that the element operations keep,
// checked from scratch.
#include <set>
#include <string>
#include <vector>

#include "host/modeltool/association.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/dependency.h"
#include "host/modeltool/element_collection.h"
#include "host/modeltool/has_relationship.h"
#include "host/modeltool/inherit_relation.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"
#include "host/modeltool/operation.h"
#include "host/modeltool/parameter.h"
#include "host/modeltool/realize_relation.h"
#include "host/modeltool/role.h"

namespace host::modeltool {
namespace {

std::string Describe(const Element& element) {
  return std::string(element.KindName()) + " '" + element.Name() + "' (" +
         element.UniqueId() + ")";
}

class Checker {
 public:
  explicit Checker(const Model& model) : model_(model) {}

  // An element reachable from the roots: it must be indexed under its id.
  void Reached(const Element& element) {
    reached_.insert(&element);
    if (element.GetModel().get() != &model_) {
      Problem(Describe(element) + " is not attached to the model");
    }
    if (model_.FindElement(element.UniqueId()).get() != &element) {
      Problem(Describe(element) + " is not indexed under its unique id");
    }
  }

  // A reference from `from` to `to`: `to` must still be in the model.
  void Refers(const Element& from, const Element* to, const char* what) {
    if (to == nullptr) {
      Problem(Describe(from) + " has no " + what);
    } else if (model_.FindElement(to->UniqueId()).get() != to) {
      Problem(Describe(from) + " refers to " + what + " " + Describe(*to) +
              ", which is not in the model");
    }
  }

  void Problem(std::string text) { problems_.push_back(std::move(text)); }

  const std::set<const Element*>& ReachedElements() const { return reached_; }
  std::vector<std::string> Problems() { return std::move(problems_); }

 private:
  const Model& model_;
  std::set<const Element*> reached_;
  std::vector<std::string> problems_;
};

template <class List, class Item>
bool Holds(const List& list, const Item* item) {
  for (const auto& entry : list) {
    auto locked = Lock(entry);
    if (locked && static_cast<const Element*>(locked.get()) ==
                      static_cast<const Element*>(item)) {
      return true;
    }
  }
  return false;
}

void CheckRelation(Checker& check, const Class& owner,
                   const ClassRelation& relation) {
  check.Reached(relation);
  if (relation.Owner().get() != &owner) {
    check.Problem(Describe(relation) + " does not point back to its owner");
  }
  if (auto supplier = relation.Supplier()) {
    check.Refers(relation, supplier.get(), "supplier");
    if (!Holds(supplier->SupplierOf(), &relation)) {
      check.Problem(Describe(*supplier) + " does not know " +
                    Describe(relation) + " points at it");
    }
  }
}

void CheckClass(Checker& check, const Class& cls) {
  check.Reached(cls);
  for (const auto& weak : cls.Components()) {
    auto component = weak.lock();
    check.Refers(cls, component.get(), "component");
    if (component && !Holds(component->Classes(), &cls)) {
      check.Problem(Describe(cls) + " is assigned to " + Describe(*component) +
                    " on one side only");
    }
  }
  for (const auto& attribute : cls.Attributes()) {
    check.Reached(*attribute);
    if (attribute->ContextClass().get() != &cls) {
      check.Problem(Describe(*attribute) + " does not point back to its class");
    }
  }
  for (const auto& operation : cls.Operations()) {
    check.Reached(*operation);
    if (operation->ContextClass().get() != &cls) {
      check.Problem(Describe(*operation) + " does not point back to its class");
    }
    for (const auto& parameter : operation->Parameters()) {
      check.Reached(*parameter);
    }
  }
  for (const auto& relation : cls.HasRelationships()) {
    CheckRelation(check, cls, *relation);
  }
  for (const auto& relation : cls.InheritRelations()) {
    CheckRelation(check, cls, *relation);
  }
  for (const auto& relation : cls.RealizeRelations()) {
    CheckRelation(check, cls, *relation);
  }
  for (const auto& weak : cls.SupplierOf()) {
    auto relation = weak.lock();
    check.Refers(cls, relation.get(), "relation pointing at it");
    if (relation && relation->Supplier().get() != &cls) {
      check.Problem(Describe(cls) + " lists " + Describe(*relation) +
                    ", which points elsewhere");
    }
  }
  for (const auto& weak : cls.Associations()) {
    check.Refers(cls, weak.lock().get(), "association");
  }
}

void CheckLogicalPackage(Checker& check, const LogicalPackage& package) {
  check.Reached(package);
  for (const auto& cls : package.Classes()) {
    if (cls->Package().get() != &package) {
      check.Problem(Describe(*cls) + " does not point back to its package");
    }
    CheckClass(check, *cls);
  }
  for (const auto& inner : package.Packages()) {
    CheckLogicalPackage(check, *inner);
  }
}

void CheckComponentPackage(Checker& check, const ComponentPackage& package) {
  check.Reached(package);
  for (const auto& component : package.Components()) {
    check.Reached(*component);
    if (component->Package().get() != &package) {
      check.Problem(Describe(*component) +
                    " does not point back to its package");
    }
    for (const auto& weak : component->Classes()) {
      auto cls = weak.lock();
      check.Refers(*component, cls.get(), "class");
      if (cls && !Holds(cls->Components(), component.get())) {
        check.Problem(Describe(*component) + " holds " + Describe(*cls) +
                      " on one side only");
      }
    }
    for (const auto& dependency : component->Dependencies()) {
      check.Reached(*dependency);
      check.Refers(*dependency, dependency->Supplier().get(), "supplier");
    }
  }
  for (const auto& inner : package.Packages()) {
    CheckComponentPackage(check, *inner);
  }
}

}  // namespace

std::vector<std::string> Model::IntegrityProblems() const {
  Checker check(*this);
  CheckComponentPackage(check, *root_component_package_);
  CheckLogicalPackage(check, *root_logical_package_);
  for (const auto& association : associations_) {
    check.Reached(*association);
    for (const auto& role : {association->Role1(), association->Role2()}) {
      check.Reached(*role);
      auto cls = role->GetClass();
      check.Refers(*role, cls.get(), "class");
      if (cls && !Holds(cls->Associations(), association.get())) {
        check.Problem(Describe(*cls) + " does not know its " +
                      Describe(*association));
      }
      if (role->GetAssociation() != association) {
        check.Problem(Describe(*role) + " does not point to its association");
      }
    }
  }
  std::set<const Element*> listed;
  for (const auto& component : components_) listed.insert(component.get());
  for (const auto& cls : classes_) listed.insert(cls.get());
  for (const Element* element : listed) {
    if (!check.ReachedElements().count(element)) {
      check.Problem(Describe(*element) +
                    " is listed by the model but lies in no package");
    }
  }
  size_t reached_listed = 0;
  for (const Element* element : check.ReachedElements()) {
    if (dynamic_cast<const Component*>(element) ||
        dynamic_cast<const Class*>(element)) {
      ++reached_listed;
    }
  }
  if (reached_listed != listed.size() ||
      listed.size() != components_.size() + classes_.size()) {
    check.Problem(
        "the model's lists of components and classes do not match "
        "its packages");
  }
  for (const auto& [id, weak] : by_unique_id_) {
    auto element = weak.lock();
    if (!element || !check.ReachedElements().count(element.get())) {
      check.Problem("the index holds the unique id " + id +
                    " of an element that is not in the model");
    }
  }
  auto selected = [&](const auto& list) {
    for (const auto& weak : list) {
      auto element = weak.lock();
      if (!element || !check.ReachedElements().count(element.get())) {
        check.Problem(
            "the selection holds an element that is not in the model");
      }
    }
  };
  selected(selected_components_);
  selected(selected_component_packages_);
  selected(selected_classes_);
  selected(selected_logical_packages_);
  return check.Problems();
}

}  // namespace host::modeltool
