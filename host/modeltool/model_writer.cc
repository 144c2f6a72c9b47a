#include "host/modeltool/model_writer.h"

#include <nlohmann/json.hpp>

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
#include "host/modeltool/model_format.h"
#include "host/modeltool/operation.h"
#include "host/modeltool/parameter.h"
#include "host/modeltool/realize_relation.h"
#include "host/modeltool/role.h"

namespace host::modeltool {
namespace {

namespace f = model_format;
using Json = nlohmann::ordered_json;

// Fields with their default value are left out, so files stay small and easy
// to write by hand; the reader puts the defaults back.
void PutText(Json& object, const char* field, const std::string& text) {
  if (!text.empty()) object[field] = text;
}

Json ElementJson(const Element& element) {
  Json object = Json::object();
  object[f::kId] = element.UniqueId();
  object[f::kName] = element.Name();
  PutText(object, f::kStereotype, element.Stereotype());
  if (!element.ToolProperties().empty()) {
    Json& properties = object[f::kToolProperties] = Json::array();
    for (const auto& property : element.ToolProperties()) {
      properties.push_back({{f::kTool, property->Tool()},
                            {f::kName, property->Name()},
                            {f::kValue, property->Value()},
                            {f::kType, property->Type()}});
    }
  }
  return object;
}

template <class List>
Json IdList(const List& list) {
  Json ids = Json::array();
  for (const auto& item : list) {
    if (auto element = Lock(item)) ids.push_back(element->UniqueId());
  }
  return ids;
}

void PutIds(Json& object, const char* field, const Json& ids) {
  if (!ids.empty()) object[field] = ids;
}

template <class R>
void PutRelations(Json& object, const char* field,
                  const std::vector<std::shared_ptr<R>>& relations) {
  if (relations.empty()) return;
  Json& list = object[field] = Json::array();
  for (const auto& relation : relations) {
    Json item = ElementJson(*relation);
    if (auto supplier = relation->Supplier()) {
      item[f::kSupplier] = supplier->UniqueId();
    } else {
      PutText(item, f::kSupplierName, relation->SupplierName());
    }
    list.push_back(std::move(item));
  }
}

Json ClassJson(const Class& cls) {
  Json object = ElementJson(cls);
  PutIds(object, f::kComponents, IdList(cls.Components()));
  PutText(object, f::kAddInName, cls.ExplicitAddInName());
  if (cls.IsExcludedFromSelection()) object[f::kExcludedFromSelection] = true;
  if (!cls.Attributes().empty()) {
    Json& list = object[f::kAttributes] = Json::array();
    for (const auto& attribute : cls.Attributes()) {
      Json item = ElementJson(*attribute);
      PutText(item, f::kType, attribute->Type());
      PutText(item, f::kInitialValue, attribute->InitialValue());
      list.push_back(std::move(item));
    }
  }
  if (!cls.Operations().empty()) {
    Json& list = object[f::kOperations] = Json::array();
    for (const auto& operation : cls.Operations()) {
      Json item = ElementJson(*operation);
      PutText(item, f::kReturnType, operation->ReturnType());
      if (!operation->Parameters().empty()) {
        Json& parameters = item[f::kParameters] = Json::array();
        for (const auto& parameter : operation->Parameters()) {
          Json one = ElementJson(*parameter);
          PutText(one, f::kType, parameter->Type());
          PutText(one, f::kDefaultValue, parameter->DefaultValue());
          parameters.push_back(std::move(one));
        }
      }
      list.push_back(std::move(item));
    }
  }
  PutRelations(object, f::kHasRelationships, cls.HasRelationships());
  PutRelations(object, f::kInheritRelations, cls.InheritRelations());
  PutRelations(object, f::kRealizeRelations, cls.RealizeRelations());
  return object;
}

Json LogicalPackageJson(const LogicalPackage& package) {
  Json object = ElementJson(package);
  if (!package.IsModifiable()) object[f::kModifiable] = false;
  if (!package.Classes().empty()) {
    Json& list = object[f::kClasses] = Json::array();
    for (const auto& cls : package.Classes()) list.push_back(ClassJson(*cls));
  }
  if (!package.Packages().empty()) {
    Json& list = object[f::kPackages] = Json::array();
    for (const auto& inner : package.Packages()) {
      list.push_back(LogicalPackageJson(*inner));
    }
  }
  return object;
}

Json ComponentJson(const Component& component) {
  Json object = ElementJson(component);
  PutText(object, f::kLanguage, component.Language());
  PutIds(object, f::kClasses, IdList(component.Classes()));
  if (!component.Dependencies().empty()) {
    Json& list = object[f::kDependencies] = Json::array();
    for (const auto& dependency : component.Dependencies()) {
      Json item = ElementJson(*dependency);
      item[f::kSupplier] = dependency->Supplier()->UniqueId();
      list.push_back(std::move(item));
    }
  }
  return object;
}

Json ComponentPackageJson(const ComponentPackage& package) {
  Json object = ElementJson(package);
  if (!package.IsModifiable()) object[f::kModifiable] = false;
  if (!package.Components().empty()) {
    Json& list = object[f::kComponents] = Json::array();
    for (const auto& component : package.Components()) {
      list.push_back(ComponentJson(*component));
    }
  }
  if (!package.Packages().empty()) {
    Json& list = object[f::kPackages] = Json::array();
    for (const auto& inner : package.Packages()) {
      list.push_back(ComponentPackageJson(*inner));
    }
  }
  return object;
}

Json RoleJson(const Role& role) {
  Json object = ElementJson(role);
  object[f::kClass] = role.GetClass()->UniqueId();
  if (!role.IsNavigable()) object[f::kNavigable] = false;
  PutText(object, f::kCardinality, role.Cardinality());
  if (role.IsAggregate()) object[f::kAggregate] = true;
  return object;
}

}  // namespace

std::string ModelWriter::ToText(const Model& model) {
  Json file = Json::object();
  file[f::kFormat] = f::kFormatName;
  file[f::kVersionField] = f::kVersion;
  file[f::kName] = model.Name();
  PutText(file, f::kDefaultLanguage, model.DefaultLanguage());
  if (model.AskForBackup()) file[f::kAskForBackup] = true;
  file[f::kComponentView] = ComponentPackageJson(*model.RootComponentPackage());
  file[f::kLogicalView] = LogicalPackageJson(*model.RootLogicalPackage());
  if (!model.Associations().empty()) {
    Json& list = file[f::kAssociations] = Json::array();
    for (const auto& association : model.Associations()) {
      Json item = ElementJson(*association);
      item[f::kRoles] = {RoleJson(*association->Role1()),
                         RoleJson(*association->Role2())};
      list.push_back(std::move(item));
    }
  }
  Json selection = Json::object();
  PutIds(selection, f::kComponents, IdList(model.SelectedComponents()));
  PutIds(selection, f::kComponentPackages,
         IdList(model.SelectedComponentPackages()));
  PutIds(selection, f::kClasses, IdList(model.SelectedClasses()));
  PutIds(selection, f::kLogicalPackages,
         IdList(model.SelectedLogicalPackages()));
  if (!selection.empty()) file[f::kSelection] = std::move(selection);
  return file.dump(1) + "\n";
}

}  // namespace host::modeltool
