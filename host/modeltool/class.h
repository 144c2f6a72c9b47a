// A class of the logical model, with its members (attributes, operations,
// has-, inherit- and realize-relations), the associations it takes part in
// and the components it is assigned to.
#ifndef KELQLN_HOST_MODELTOOL_CLASS_H_
#define KELQLN_HOST_MODELTOOL_CLASS_H_

#include <memory>
#include <string>
#include <vector>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Association;
class Attribute;
class ClassRelation;
class Component;
class HasRelationship;
class InheritRelation;
class LogicalPackage;
class Operation;
class RealizeRelation;
class Role;

class Class : public ElementImpl<Class> {
 public:
  // Made by LogicalPackage::NewClass.
  explicit Class(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<Class>& Members();
  const char* KindName() const override;

  std::shared_ptr<LogicalPackage> Package() const { return package_.lock(); }

  // Class-to-component assignment, kept on both sides. AssignTo is false
  // when the class was assigned already, UnassignFrom when it was not.
  bool AssignTo(const std::shared_ptr<Component>& component);
  bool UnassignFrom(const std::shared_ptr<Component>& component);
  const std::vector<std::weak_ptr<Component>>& Components() const {
    return components_;
  }

  // The language add-in that handles the class: the value set, else the
  // language of its first component, else "".
  std::string AddInName() const;
  void SetAddInName(std::string name) { add_in_name_ = std::move(name); }
  // The value set ("" when none), as model files keep it.
  const std::string& ExplicitAddInName() const { return add_in_name_; }
  bool IsExcludedFromSelection() const { return excluded_from_selection_; }
  void SetExcludedFromSelection(bool excluded) {
    excluded_from_selection_ = excluded;
  }

  // New members; `unique_id` "" takes a new one. A relation's supplier may
  // be nullptr (a class outside the model, known by `supplier_name` only);
  // otherwise it is a class of the same model and names the relation's
  // supplier.
  std::shared_ptr<Attribute> NewAttribute(std::string name,
                                          const std::string& unique_id = "");
  std::shared_ptr<Operation> NewOperation(std::string name,
                                          const std::string& unique_id = "");
  std::shared_ptr<HasRelationship> NewHasRelationship(
      std::string name, const std::shared_ptr<Class>& supplier,
      std::string supplier_name = "", const std::string& unique_id = "");
  std::shared_ptr<InheritRelation> NewInheritRelation(
      std::string name, const std::shared_ptr<Class>& supplier,
      std::string supplier_name = "", const std::string& unique_id = "");
  std::shared_ptr<RealizeRelation> NewRealizeRelation(
      std::string name, const std::shared_ptr<Class>& supplier,
      std::string supplier_name = "", const std::string& unique_id = "");

  // Deletions: true when done, false when the element is not this class's.
  // Deletions take the element by value: a caller may pass the very entry of
  // the list that the deletion removes.
  bool DeleteAttribute(std::shared_ptr<Attribute> attribute);
  bool DeleteOperation(std::shared_ptr<Operation> operation);
  bool DeleteHasRelationship(std::shared_ptr<HasRelationship> relation);
  bool DeleteInheritRelation(std::shared_ptr<InheritRelation> relation);
  bool DeleteRealizeRelation(std::shared_ptr<RealizeRelation> relation);
  // Deletes an association this class takes part in, with both its roles.
  bool DeleteAssociation(std::shared_ptr<Association> association);

  const std::vector<std::shared_ptr<Attribute>>& Attributes() const {
    return attributes_;
  }
  const std::vector<std::shared_ptr<Operation>>& Operations() const {
    return operations_;
  }
  const std::vector<std::shared_ptr<HasRelationship>>& HasRelationships()
      const {
    return has_relationships_;
  }
  const std::vector<std::shared_ptr<InheritRelation>>& InheritRelations()
      const {
    return inherit_relations_;
  }
  const std::vector<std::shared_ptr<RealizeRelation>>& RealizeRelations()
      const {
    return realize_relations_;
  }
  // The associations the class takes part in, in the order they were made.
  const std::vector<std::weak_ptr<Association>>& Associations() const {
    return associations_;
  }
  // The roles this class owns: of each of its associations, the role at the
  // other end (both roles of an association of the class with itself).
  std::vector<std::shared_ptr<Role>> Roles() const;
  // The relations of classes (this one included) whose supplier is this
  // class.
  const std::vector<std::weak_ptr<ClassRelation>>& SupplierOf() const {
    return supplier_of_;
  }

 private:
  friend class ClassRelation;
  friend class LogicalPackage;
  friend class Model;
  friend class ModelReader;
  template <class R>
  std::shared_ptr<R> NewRelation(std::vector<std::shared_ptr<R>>& list,
                                 std::string name,
                                 const std::shared_ptr<Class>& supplier,
                                 std::string supplier_name,
                                 const std::string& unique_id);
  template <class R>
  bool DeleteRelation(std::vector<std::shared_ptr<R>>& list,
                      std::shared_ptr<R> relation);

  std::weak_ptr<LogicalPackage> package_;
  std::vector<std::weak_ptr<Component>> components_;
  std::string add_in_name_;
  bool excluded_from_selection_ = false;
  std::vector<std::shared_ptr<Attribute>> attributes_;
  std::vector<std::shared_ptr<Operation>> operations_;
  std::vector<std::shared_ptr<HasRelationship>> has_relationships_;
  std::vector<std::shared_ptr<InheritRelation>> inherit_relations_;
  std::vector<std::shared_ptr<RealizeRelation>> realize_relations_;
  std::vector<std::weak_ptr<Association>> associations_;
  std::vector<std::weak_ptr<ClassRelation>> supplier_of_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_CLASS_H_
