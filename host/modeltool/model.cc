#include "host/modeltool/model.h"

#include <algorithm>
#include <set>
#include <utility>

#include "automation/error.h"
#include "external/orel.h"
#include "host/modeltool/application.h"
#include "host/modeltool/association.h"
#include "host/modeltool/atomic_file.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/dependency.h"
#include "host/modeltool/element_collection.h"
#include "host/modeltool/has_relationship.h"
#include "host/modeltool/inherit_relation.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model_reader.h"
#include "host/modeltool/model_writer.h"
#include "host/modeltool/operation.h"
#include "host/modeltool/parameter.h"
#include "host/modeltool/realize_relation.h"
#include "host/modeltool/role.h"

namespace host::modeltool {
namespace {

// A generator that keeps answering ids the model has is broken; after this
// many tries the model gives up instead of looping for ever.
constexpr int kMaxIdTries = 1000;

template <class T>
void EraseElement(std::vector<std::weak_ptr<T>>& list, const Element& element) {
  std::erase_if(list, [&element](const std::weak_ptr<T>& item) {
    auto locked = item.lock();
    return !locked || static_cast<const Element*>(locked.get()) == &element;
  });
}

template <class T>
bool EraseElement(std::vector<std::shared_ptr<T>>& list,
                  const Element& element) {
  return std::erase_if(list, [&element](const std::shared_ptr<T>& item) {
           return static_cast<const Element*>(item.get()) == &element;
         }) > 0;
}

template <class T>
void AddOnce(std::vector<std::weak_ptr<T>>& list,
             const std::shared_ptr<T>& item) {
  for (const auto& present : list) {
    if (present.lock() == item) return;
  }
  list.push_back(item);
}

}  // namespace

Model::Model(UniqueIdGenerator generator)
    : generator_(generator ? std::move(generator) : NewGuidText) {}

std::shared_ptr<Model> Model::Create(UniqueIdGenerator generator) {
  auto model = std::make_shared<Model>(std::move(generator));
  auto components = std::make_shared<ComponentPackage>("Component View");
  model->Register(*components, "");
  model->root_component_package_ = components;
  auto classes = std::make_shared<LogicalPackage>("Logical View");
  model->Register(*classes, "");
  model->root_logical_package_ = classes;
  return model;
}

std::shared_ptr<Model> Model::Load(const std::string& path,
                                   UniqueIdGenerator generator) {
  return ModelReader::ReadFile(path, std::move(generator));
}

void Model::SetUniqueIdGenerator(UniqueIdGenerator generator) {
  generator_ = generator ? std::move(generator) : NewGuidText;
}

void Model::Register(Element& element, const std::string& unique_id) {
  std::string id = unique_id;
  if (id.empty()) {
    for (int tries = 0; id.empty() || by_unique_id_.count(id) != 0; ++tries) {
      if (tries == kMaxIdTries) {
        throw automation::Error(
            automation::kDuplicateKey,
            "The unique id generator keeps answering ids the model has");
      }
      id = generator_();
    }
  } else if (by_unique_id_.count(id) != 0) {
    throw automation::Error(
        automation::kDuplicateKey,
        "The unique id '" + id + "' belongs to another element of the model");
  }
  element.model_ = Self();
  element.unique_id_ = id;
  by_unique_id_.emplace(std::move(id), element.SharedElement());
}

void Model::ChangeUniqueId(Element& element, const std::string& unique_id) {
  if (unique_id.empty()) {
    throw automation::Error(automation::kInvalidProcedureCall,
                            "A unique id cannot be empty");
  }
  auto taken = by_unique_id_.find(unique_id);
  if (taken != by_unique_id_.end()) {
    if (taken->second.lock().get() == &element) return;
    throw automation::Error(automation::kDuplicateKey,
                            "The unique id '" + unique_id +
                                "' belongs to another element of the model");
  }
  auto entry = by_unique_id_.extract(element.unique_id_);
  entry.key() = unique_id;
  by_unique_id_.insert(std::move(entry));
  element.unique_id_ = unique_id;
}

void Model::Forget(Element& element) {
  auto found = by_unique_id_.find(element.unique_id_);
  if (found != by_unique_id_.end() && found->second.lock().get() == &element) {
    by_unique_id_.erase(found);
  }
  element.model_.reset();
}

void Model::ForgetSelected(const Element& element) {
  EraseElement(selected_components_, element);
  EraseElement(selected_component_packages_, element);
  EraseElement(selected_classes_, element);
  EraseElement(selected_logical_packages_, element);
}

std::shared_ptr<Element> Model::FindElement(std::string_view unique_id) const {
  auto found = by_unique_id_.find(unique_id);
  return found == by_unique_id_.end() ? nullptr : found->second.lock();
}

void Model::AddComponent(std::shared_ptr<Component> component) {
  components_.push_back(std::move(component));
}

void Model::AddClass(std::shared_ptr<Class> cls) {
  classes_.push_back(std::move(cls));
}

std::shared_ptr<Association> Model::NewAssociation(
    const std::shared_ptr<Class>& end1, const std::shared_ptr<Class>& end2,
    std::string name, const std::string& unique_id) {
  return MakeAssociation(end1, end2, std::move(name), unique_id, "", "");
}

std::shared_ptr<Association> Model::MakeAssociation(
    const std::shared_ptr<Class>& end1, const std::shared_ptr<Class>& end2,
    std::string name, const std::string& unique_id, const std::string& role1_id,
    const std::string& role2_id) {
  for (const auto& end : {end1, end2}) {
    if (!end || end->GetModel().get() != this) {
      throw automation::Error(
          automation::kInvalidProcedureCall,
          "An association joins two classes of the same model");
    }
  }
  auto association = std::make_shared<Association>(std::move(name));
  Register(*association, unique_id);
  auto role1 = std::make_shared<Role>("");
  auto role2 = std::make_shared<Role>("");
  try {
    Register(*role1, role1_id);
    Register(*role2, role2_id);
  } catch (const automation::Error&) {
    Forget(*role1);
    Forget(*association);
    throw;
  }
  role1->association_ = association;
  role1->class_ = end1;
  role2->association_ = association;
  role2->class_ = end2;
  association->role1_ = role1;
  association->role2_ = role2;
  associations_.push_back(association);
  AddOnce(end1->associations_, association);
  AddOnce(end2->associations_, association);
  return association;
}

bool Model::DeleteAssociation(std::shared_ptr<Association> association) {
  if (!association || !EraseElement(associations_, *association)) return false;
  for (const auto& role : {association->role1_, association->role2_}) {
    if (auto cls = role->GetClass())
      EraseElement(cls->associations_, *association);
    Forget(*role);
  }
  Forget(*association);
  return true;
}

void Model::DestroyRelation(ClassRelation& relation) {
  if (auto supplier = relation.Supplier()) {
    EraseElement(supplier->supplier_of_, relation);
  }
  Forget(relation);
}

void Model::DestroyOperation(Operation& operation) {
  for (const auto& parameter : operation.parameters_) Forget(*parameter);
  Forget(operation);
}

void Model::DestroyClass(std::shared_ptr<Class> cls) {
  // Relations of other classes that point at this one go with it.
  auto pointing = cls->supplier_of_;
  for (const auto& weak : pointing) {
    auto relation = weak.lock();
    if (!relation) continue;
    if (auto owner = relation->Owner(); owner && owner != cls) {
      EraseElement(owner->has_relationships_, *relation);
      EraseElement(owner->inherit_relations_, *relation);
      EraseElement(owner->realize_relations_, *relation);
      DestroyRelation(*relation);
    }
  }
  for (const auto& relation : cls->has_relationships_)
    DestroyRelation(*relation);
  for (const auto& relation : cls->inherit_relations_)
    DestroyRelation(*relation);
  for (const auto& relation : cls->realize_relations_)
    DestroyRelation(*relation);
  cls->has_relationships_.clear();
  cls->inherit_relations_.clear();
  cls->realize_relations_.clear();
  for (const auto& attribute : cls->attributes_) Forget(*attribute);
  cls->attributes_.clear();
  for (const auto& operation : cls->operations_) DestroyOperation(*operation);
  cls->operations_.clear();
  auto associations = cls->associations_;
  for (const auto& weak : associations) {
    if (auto association = weak.lock()) DeleteAssociation(association);
  }
  for (const auto& weak : cls->components_) {
    if (auto component = weak.lock()) EraseElement(component->classes_, *cls);
  }
  cls->components_.clear();
  if (auto package = cls->Package()) EraseElement(package->classes_, *cls);
  cls->package_.reset();
  EraseElement(classes_, *cls);
  ForgetSelected(*cls);
  Forget(*cls);
}

void Model::DestroyComponent(std::shared_ptr<Component> component) {
  for (const auto& weak : component->classes_) {
    if (auto cls = weak.lock()) EraseElement(cls->components_, *component);
  }
  component->classes_.clear();
  for (const auto& dependency : component->dependencies_) {
    if (auto supplier = dependency->Supplier()) {
      EraseElement(supplier->dependents_, *dependency);
    }
    Forget(*dependency);
  }
  component->dependencies_.clear();
  auto dependents = component->dependents_;
  for (const auto& weak : dependents) {
    if (auto dependency = weak.lock()) {
      if (auto client = dependency->Client()) {
        client->DeleteDependency(dependency);
      }
    }
  }
  if (auto package = component->Package()) {
    EraseElement(package->components_, *component);
  }
  component->package_.reset();
  EraseElement(components_, *component);
  ForgetSelected(*component);
  Forget(*component);
}

void Model::Select(const std::shared_ptr<Element>& element) {
  if (!element || element->GetModel().get() != this) {
    throw automation::Error(automation::kInvalidProcedureCall,
                            "Only an element of the model can be selected");
  }
  if (auto component = std::dynamic_pointer_cast<Component>(element)) {
    AddOnce(selected_components_, component);
  } else if (auto cls = std::dynamic_pointer_cast<Class>(element)) {
    AddOnce(selected_classes_, cls);
  } else if (auto components =
                 std::dynamic_pointer_cast<ComponentPackage>(element)) {
    AddOnce(selected_component_packages_, components);
  } else if (auto classes =
                 std::dynamic_pointer_cast<LogicalPackage>(element)) {
    AddOnce(selected_logical_packages_, classes);
  } else {
    throw automation::Error(
        automation::kInvalidProcedureCall,
        std::string("A ") + element->KindName() + " cannot be selected");
  }
}

void Model::ClearSelection() {
  selected_components_.clear();
  selected_component_packages_.clear();
  selected_classes_.clear();
  selected_logical_packages_.clear();
}

void Model::Save() {
  if (file_path_.empty()) {
    throw automation::Error(automation::kPathFileAccessError,
                            "The model has no file yet: save it under a name");
  }
  if (saves_skipped_) return;
  WriteFileAtomically(file_path_, ModelWriter::ToText(*this));
}

void Model::SaveAs(const std::string& path) {
  if (path.empty()) {
    throw automation::Error(automation::kInvalidProcedureCall,
                            "A model file needs a name");
  }
  if (saves_skipped_) return;
  WriteFileAtomically(path, ModelWriter::ToText(*this));
  file_path_ = path;
}

const automation::MemberTable<Model>& Model::Members() {
  using automation::Args;
  using automation::CallKind;
  using automation::CStr;
  using automation::Variant;
  namespace orel = external::orel;
  static const automation::MemberTable<Model> table(
      "Model",
      {
          {orel::element::kName, "Name", CallKind::kPropertyGet,
           [](Model& self, Args&) { return Variant(self.name_); }},
          {orel::element::kApplication, "Application", CallKind::kPropertyGet,
           [](Model& self, Args&) { return Variant(self.GetApplication()); }},
          {orel::model::kAllComponents, "AllComponents", CallKind::kMethod,
           [](Model& self, Args&) {
             auto model = self.Self();
             return Variant(ElementCollection<Component>::Of(
                 model, self.components_, [model](std::string_view id) {
                   return model->Find<Component>(id);
                 }));
           }},
          {orel::model::kAllClasses, "AllClasses", CallKind::kMethod,
           [](Model& self, Args&) {
             auto model = self.Self();
             return Variant(ElementCollection<Class>::Of(
                 model, self.classes_, [model](std::string_view id) {
                   return model->Find<Class>(id);
                 }));
           }},
          {orel::model::kSelectedComponents, "SelectedComponents",
           CallKind::kMethod,
           [](Model& self, Args&) {
             return Variant(
                 ElementCollection<Component, std::weak_ptr<Component>>::Of(
                     self.Self(), self.selected_components_));
           }},
          {orel::model::kSelectedComponentPackages, "SelectedComponentPackages",
           CallKind::kMethod,
           [](Model& self, Args&) {
             return Variant(
                 ElementCollection<ComponentPackage,
                                   std::weak_ptr<ComponentPackage>>::
                     Of(self.Self(), self.selected_component_packages_));
           }},
          {orel::model::kSelectedClasses, "SelectedClasses", CallKind::kMethod,
           [](Model& self, Args&) {
             return Variant(ElementCollection<Class, std::weak_ptr<Class>>::Of(
                 self.Self(), self.selected_classes_));
           }},
          {orel::model::kSelectedLogicalPackages, "SelectedLogicalPackages",
           CallKind::kMethod,
           [](Model& self, Args&) {
             return Variant(
                 ElementCollection<LogicalPackage,
                                   std::weak_ptr<LogicalPackage>>::
                     Of(self.Self(), self.selected_logical_packages_));
           }},
          {orel::model::kRootComponentPackage, "RootComponentPackage",
           CallKind::kPropertyGet,
           [](Model& self, Args&) {
             return Variant(self.root_component_package_);
           }},
          {automation::kNamedOnly, "RootLogicalPackage", CallKind::kPropertyGet,
           [](Model& self, Args&) {
             return Variant(self.root_logical_package_);
           }},
          {automation::kNamedOnly, "Associations", CallKind::kPropertyGet,
           [](Model& self, Args&) {
             return Variant(ElementCollection<Association>::Of(
                 self.Self(), self.associations_));
           }},
          {orel::model::kDefaultLanguage, "DefaultLanguage",
           CallKind::kPropertyGet,
           [](Model& self, Args&) { return Variant(self.default_language_); }},
          {orel::model::kDefaultLanguage, "DefaultLanguage",
           CallKind::kPropertyPut,
           [](Model& self, Args& args) {
             self.default_language_ = CStr(automation::PutValue(args));
             return Variant();
           }},
          {orel::model::kAskForBackup, "AskForBackup", CallKind::kPropertyGet,
           [](Model& self, Args&) { return Variant(self.ask_for_backup_); }},
          {orel::model::kAskForBackup, "AskForBackup", CallKind::kPropertyPut,
           [](Model& self, Args& args) {
             self.ask_for_backup_ =
                 automation::CBool(automation::PutValue(args));
             return Variant();
           }},
          {orel::model::kFilePath, "FilePath", CallKind::kPropertyGet,
           [](Model& self, Args&) { return Variant(self.file_path_); }},
          {orel::model::kSave, "Save", CallKind::kMethod,
           [](Model& self, Args&) {
             self.Save();
             return Variant();
           }},
          {orel::model::kSaveAs, "SaveAs", CallKind::kMethod,
           [](Model& self, Args& args) {
             self.SaveAs(CStr(automation::RequiredArg(args, 0)));
             return Variant();
           }},
      });
  return table;
}

}  // namespace host::modeltool
