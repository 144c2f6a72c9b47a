#include "host/modeltool/class.h"

#include <algorithm>
#include <utility>

#include "automation/error.h"
#include "external/orel.h"
#include "host/modeltool/association.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/component.h"
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

using automation::Args;
using automation::CallKind;
using automation::RequiredArg;
using automation::Variant;
namespace orel = external::orel;

const char* Class::KindName() const { return orel::kind::kClass; }

bool Class::AssignTo(const std::shared_ptr<Component>& component) {
  auto model = RequireModel();
  if (!component || component->GetModel() != model) {
    throw automation::Error(
        automation::kInvalidProcedureCall,
        "A class is assigned to a component of the same model");
  }
  for (const auto& present : components_) {
    if (present.lock() == component) return false;
  }
  components_.push_back(component);
  component->classes_.push_back(Self());
  return true;
}

bool Class::UnassignFrom(const std::shared_ptr<Component>& component) {
  if (!component) return false;
  bool removed = std::erase_if(components_, [&](const auto& weak) {
                   return weak.lock() == component;
                 }) > 0;
  std::erase_if(component->classes_,
                [this](const auto& weak) { return weak.lock().get() == this; });
  return removed;
}

std::string Class::AddInName() const {
  if (!add_in_name_.empty()) return add_in_name_;
  for (const auto& weak : components_) {
    if (auto component = weak.lock()) return component->Language();
  }
  return "";
}

std::shared_ptr<Attribute> Class::NewAttribute(std::string name,
                                               const std::string& unique_id) {
  auto model = RequireModel();
  auto attribute = std::make_shared<Attribute>(std::move(name));
  model->Register(*attribute, unique_id);
  attribute->owner_ = Self();
  attributes_.push_back(attribute);
  return attribute;
}

std::shared_ptr<Operation> Class::NewOperation(std::string name,
                                               const std::string& unique_id) {
  auto model = RequireModel();
  auto operation = std::make_shared<Operation>(std::move(name));
  model->Register(*operation, unique_id);
  operation->owner_ = Self();
  operations_.push_back(operation);
  return operation;
}

template <class R>
std::shared_ptr<R> Class::NewRelation(std::vector<std::shared_ptr<R>>& list,
                                      std::string name,
                                      const std::shared_ptr<Class>& supplier,
                                      std::string supplier_name,
                                      const std::string& unique_id) {
  auto model = RequireModel();
  if (supplier && supplier->GetModel() != model) {
    throw automation::Error(
        automation::kInvalidProcedureCall,
        "A relation's supplier is a class of the same model");
  }
  auto relation = std::make_shared<R>(std::move(name));
  model->Register(*relation, unique_id);
  relation->owner_ = Self();
  relation->SetSupplier(supplier, std::move(supplier_name));
  list.push_back(relation);
  return relation;
}

std::shared_ptr<HasRelationship> Class::NewHasRelationship(
    std::string name, const std::shared_ptr<Class>& supplier,
    std::string supplier_name, const std::string& unique_id) {
  return NewRelation(has_relationships_, std::move(name), supplier,
                     std::move(supplier_name), unique_id);
}

std::shared_ptr<InheritRelation> Class::NewInheritRelation(
    std::string name, const std::shared_ptr<Class>& supplier,
    std::string supplier_name, const std::string& unique_id) {
  return NewRelation(inherit_relations_, std::move(name), supplier,
                     std::move(supplier_name), unique_id);
}

std::shared_ptr<RealizeRelation> Class::NewRealizeRelation(
    std::string name, const std::shared_ptr<Class>& supplier,
    std::string supplier_name, const std::string& unique_id) {
  return NewRelation(realize_relations_, std::move(name), supplier,
                     std::move(supplier_name), unique_id);
}

bool Class::DeleteAttribute(std::shared_ptr<Attribute> attribute) {
  auto at = std::find(attributes_.begin(), attributes_.end(), attribute);
  if (!attribute || at == attributes_.end()) return false;
  attributes_.erase(at);
  RequireModel()->Forget(*attribute);
  return true;
}

bool Class::DeleteOperation(std::shared_ptr<Operation> operation) {
  auto at = std::find(operations_.begin(), operations_.end(), operation);
  if (!operation || at == operations_.end()) return false;
  operations_.erase(at);
  RequireModel()->DestroyOperation(*operation);
  return true;
}

template <class R>
bool Class::DeleteRelation(std::vector<std::shared_ptr<R>>& list,
                           std::shared_ptr<R> relation) {
  auto at = std::find(list.begin(), list.end(), relation);
  if (!relation || at == list.end()) return false;
  list.erase(at);
  RequireModel()->DestroyRelation(*relation);
  return true;
}

bool Class::DeleteHasRelationship(std::shared_ptr<HasRelationship> relation) {
  return DeleteRelation(has_relationships_, relation);
}

bool Class::DeleteInheritRelation(std::shared_ptr<InheritRelation> relation) {
  return DeleteRelation(inherit_relations_, relation);
}

bool Class::DeleteRealizeRelation(std::shared_ptr<RealizeRelation> relation) {
  return DeleteRelation(realize_relations_, relation);
}

bool Class::DeleteAssociation(std::shared_ptr<Association> association) {
  if (!association) return false;
  bool takes_part =
      std::any_of(associations_.begin(), associations_.end(),
                  [&](const auto& weak) { return weak.lock() == association; });
  return takes_part && RequireModel()->DeleteAssociation(association);
}

std::vector<std::shared_ptr<Role>> Class::Roles() const {
  std::vector<std::shared_ptr<Role>> roles;
  for (const auto& weak : associations_) {
    auto association = weak.lock();
    if (!association) continue;
    for (const auto& role : {association->Role1(), association->Role2()}) {
      if (role->ContextClass().get() == this) roles.push_back(role);
    }
  }
  return roles;
}

namespace {

template <class T>
Variant MemberCollection(Class& self,
                         const std::vector<std::shared_ptr<T>>& list) {
  return Variant(ElementCollection<T>::Of(self.Self(), list));
}

}  // namespace

const automation::MemberTable<Class>& Class::Members() {
  static const automation::MemberTable<Class> table(
      "Class",
      WithElementMembers({
          {orel::class_::kComponents, "Components", CallKind::kMethod,
           [](Class& self, Args&) {
             return Variant(
                 ElementCollection<Component, std::weak_ptr<Component>>::Of(
                     self.Self(), self.components_));
           }},
          {orel::class_::kAssignToComponent, "AssignTo", CallKind::kMethod,
           [](Class& self, Args& args) {
             auto component = ElementArg<Component>(RequiredArg(args, 0));
             if (!component)
               throw automation::Error(automation::kObjectRequired);
             return Variant(self.AssignTo(component));
           }},
          {automation::kNamedOnly, "UnassignFrom", CallKind::kMethod,
           [](Class& self, Args& args) {
             return Variant(self.UnassignFrom(
                 ElementArg<Component>(RequiredArg(args, 0))));
           }},
          {orel::class_::kPackage, "Package", CallKind::kPropertyGet,
           [](Class& self, Args&) { return Variant(self.Package()); }},
          {orel::class_::kAddInName, "AddInName", CallKind::kPropertyGet,
           [](Class& self, Args&) { return Variant(self.AddInName()); }},
          {orel::class_::kAddInName, "AddInName", CallKind::kPropertyPut,
           [](Class& self, Args& args) {
             self.add_in_name_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
          {orel::class_::kExcludedFromSelection, "ExcludedFromSelection",
           CallKind::kPropertyGet,
           [](Class& self, Args&) {
             return Variant(self.excluded_from_selection_);
           }},
          {orel::class_::kExcludedFromSelection, "ExcludedFromSelection",
           CallKind::kPropertyPut,
           [](Class& self, Args& args) {
             self.excluded_from_selection_ =
                 automation::CBool(automation::PutValue(args));
             return Variant();
           }},
          {orel::class_::kDeleteAttribute, "DeleteAttribute", CallKind::kMethod,
           [](Class& self, Args& args) {
             return Variant(self.DeleteAttribute(
                 ElementArg<Attribute>(RequiredArg(args, 0))));
           }},
          {orel::class_::kDeleteOperation, "DeleteOperation", CallKind::kMethod,
           [](Class& self, Args& args) {
             return Variant(self.DeleteOperation(
                 ElementArg<Operation>(RequiredArg(args, 0))));
           }},
          {orel::class_::kDeleteHasRelationship, "DeleteHasRelationship",
           CallKind::kMethod,
           [](Class& self, Args& args) {
             return Variant(self.DeleteHasRelationship(
                 ElementArg<HasRelationship>(RequiredArg(args, 0))));
           }},
          {orel::class_::kDeleteInheritRelation, "DeleteInheritRelation",
           CallKind::kMethod,
           [](Class& self, Args& args) {
             return Variant(self.DeleteInheritRelation(
                 ElementArg<InheritRelation>(RequiredArg(args, 0))));
           }},
          {orel::class_::kDeleteRealizeRelation, "DeleteRealizeRelation",
           CallKind::kMethod,
           [](Class& self, Args& args) {
             return Variant(self.DeleteRealizeRelation(
                 ElementArg<RealizeRelation>(RequiredArg(args, 0))));
           }},
          {orel::class_::kDeleteAssociation, "DeleteAssociation",
           CallKind::kMethod,
           [](Class& self, Args& args) {
             return Variant(self.DeleteAssociation(
                 ElementArg<Association>(RequiredArg(args, 0))));
           }},
          {automation::kNamedOnly, "Attributes", CallKind::kPropertyGet,
           [](Class& self, Args&) {
             return MemberCollection(self, self.attributes_);
           }},
          {automation::kNamedOnly, "Operations", CallKind::kPropertyGet,
           [](Class& self, Args&) {
             return MemberCollection(self, self.operations_);
           }},
          {automation::kNamedOnly, "HasRelationships", CallKind::kPropertyGet,
           [](Class& self, Args&) {
             return MemberCollection(self, self.has_relationships_);
           }},
          {automation::kNamedOnly, "InheritRelations", CallKind::kPropertyGet,
           [](Class& self, Args&) {
             return MemberCollection(self, self.inherit_relations_);
           }},
          {automation::kNamedOnly, "RealizeRelations", CallKind::kPropertyGet,
           [](Class& self, Args&) {
             return MemberCollection(self, self.realize_relations_);
           }},
          {automation::kNamedOnly, "Associations", CallKind::kPropertyGet,
           [](Class& self, Args&) {
             return Variant(
                 ElementCollection<Association, std::weak_ptr<Association>>::Of(
                     self.Self(), self.associations_));
           }},
          {automation::kNamedOnly, "Roles", CallKind::kPropertyGet,
           [](Class& self, Args&) {
             return Variant(std::make_shared<ElementCollection<Role>>(
                 std::make_shared<const std::vector<std::shared_ptr<Role>>>(
                     self.Roles())));
           }},
      }));
  return table;
}

}  // namespace host::modeltool
