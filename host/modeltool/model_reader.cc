#include "host/modeltool/model_reader.h"

#include <algorithm>
#include <initializer_list>
#include <nlohmann/json.hpp>
#include <set>
#include <utility>
#include <vector>

#include "automation/error.h"
#include "host/modeltool/association.h"
#include "host/modeltool/atomic_file.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/dependency.h"
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
using Json = nlohmann::json;

// The deepest nesting of arrays and objects in `text`, counted before the
// parser builds anything, so a hostile file cannot exhaust the stack.
int NestingOf(std::string_view text) {
  int depth = 0;
  int deepest = 0;
  bool in_string = false;
  for (size_t i = 0; i < text.size(); ++i) {
    char c = text[i];
    if (in_string) {
      if (c == '\\') {
        ++i;
      } else if (c == '"') {
        in_string = false;
      }
    } else if (c == '"') {
      in_string = true;
    } else if (c == '[' || c == '{') {
      deepest = std::max(deepest, ++depth);
    } else if (c == ']' || c == '}') {
      --depth;
    }
  }
  return deepest;
}

const char* TypeOf(const Json& value) { return value.type_name(); }

}  // namespace

// Walks the parsed file, building the model; every complaint names the
// place in the file.
class ModelReader::Parser {
 public:
  Parser(std::string file_name, UniqueIdGenerator generator)
      : file_name_(std::move(file_name)),
        model_(std::make_shared<Model>(std::move(generator))) {}

  std::shared_ptr<Model> Read(const Json& file) {
    const std::string top = "(file)";
    Fields(file, top,
           {f::kFormat, f::kVersionField, f::kName, f::kDefaultLanguage,
            f::kAskForBackup, f::kComponentView, f::kLogicalView,
            f::kAssociations, f::kSelection});
    if (Text(file, f::kFormat, top, true) != f::kFormatName) {
      Fail(top, std::string("\"format\" is not \"") + f::kFormatName + "\"");
    }
    const Json* version = Field(file, f::kVersionField);
    if (!version || !version->is_number_integer() ||
        version->get<int64_t>() != f::kVersion) {
      Fail(top, "\"version\" is not " + std::to_string(f::kVersion));
    }
    model_->SetName(Text(file, f::kName, top, false));
    model_->SetDefaultLanguage(Text(file, f::kDefaultLanguage, top, false));
    model_->SetAskForBackup(Bool(file, f::kAskForBackup, top, false));

    const Json* components = Field(file, f::kComponentView);
    if (!components) Fail(top, "\"componentView\" is missing");
    RequireObject(*components, f::kComponentView);
    auto component_root = std::make_shared<ComponentPackage>(
        Text(*components, f::kName, f::kComponentView, false));
    Register(*component_root, *components, f::kComponentView);
    model_->root_component_package_ = component_root;
    ReadPackage(*components, f::kComponentView, *component_root, f::kComponents,
                [this](const Json& item, const std::string& at,
                       ComponentPackage& package) {
                  ReadComponent(item, at, package);
                });

    const Json* classes = Field(file, f::kLogicalView);
    if (!classes) Fail(top, "\"logicalView\" is missing");
    RequireObject(*classes, f::kLogicalView);
    auto class_root = std::make_shared<LogicalPackage>(
        Text(*classes, f::kName, f::kLogicalView, false));
    Register(*class_root, *classes, f::kLogicalView);
    model_->root_logical_package_ = class_root;
    ReadPackage(
        *classes, f::kLogicalView, *class_root, f::kClasses,
        [this](const Json& item, const std::string& at,
               LogicalPackage& package) { ReadClassOf(item, at, package); });

    ResolveAssignments();
    ResolveRelations();
    ResolveDependencies();
    ReadAssociations(file);
    ReadSelection(file);
    return model_;
  }

 private:
  struct PendingIds {
    std::shared_ptr<Element> element;
    std::vector<std::string> ids;
    std::string where;
  };
  struct PendingSupplier {
    std::shared_ptr<ClassRelation> relation;
    std::string id;
    std::string where;
  };
  struct PendingDependency {
    std::shared_ptr<Component> client;
    const Json* value;
    std::string where;
  };

  [[noreturn]] void Fail(const std::string& where, const std::string& what) {
    throw automation::Error(automation::kBadFileFormat,
                            file_name_ + ": " + where + ": " + what);
  }

  static std::string At(const std::string& where, const char* field) {
    return where + "." + field;
  }
  static std::string At(const std::string& where, size_t index) {
    return where + "[" + std::to_string(index) + "]";
  }

  // Refuses anything but an object with the given fields: a misspelt field
  // would otherwise be lost without a word.
  void RequireObject(const Json& value, const std::string& where) {
    if (!value.is_object()) {
      Fail(where, std::string("expected an object, found ") + TypeOf(value));
    }
  }

  void Fields(const Json& value, const std::string& where,
              std::initializer_list<const char*> allowed) {
    RequireObject(value, where);
    for (const auto& [key, item] : value.items()) {
      bool known = false;
      for (const char* name : allowed) known = known || key == name;
      if (!known) Fail(where, "unknown field \"" + key + "\"");
    }
  }

  static const Json* Field(const Json& object, const char* field) {
    auto found = object.find(field);
    return found == object.end() ? nullptr : &*found;
  }

  std::string CheckedText(const Json& value, const std::string& where) {
    if (!value.is_string()) {
      Fail(where, std::string("expected a text, found ") + TypeOf(value));
    }
    const auto& text = value.get_ref<const std::string&>();
    if (text.size() > kMaxTextSize) {
      Fail(where,
           "a text longer than " + std::to_string(kMaxTextSize) + " bytes");
    }
    return text;
  }

  std::string Text(const Json& object, const char* field,
                   const std::string& where, bool required) {
    const Json* value = Field(object, field);
    if (!value) {
      if (required) Fail(where, std::string("\"") + field + "\" is missing");
      return "";
    }
    return CheckedText(*value, At(where, field));
  }

  bool Bool(const Json& object, const char* field, const std::string& where,
            bool fallback) {
    const Json* value = Field(object, field);
    if (!value) return fallback;
    if (!value->is_boolean()) {
      Fail(At(where, field),
           std::string("expected true or false, found ") + TypeOf(*value));
    }
    return value->get<bool>();
  }

  // The array in `field`, or an empty one when the field is absent.
  const Json& Array(const Json& object, const char* field,
                    const std::string& where) {
    static const Json kEmpty = Json::array();
    const Json* value = Field(object, field);
    if (!value) return kEmpty;
    if (!value->is_array()) {
      Fail(At(where, field),
           std::string("expected an array, found ") + TypeOf(*value));
    }
    return *value;
  }

  std::vector<std::string> Ids(const Json& object, const char* field,
                               const std::string& where) {
    std::vector<std::string> ids;
    const Json& list = Array(object, field, where);
    std::set<std::string> seen;
    for (size_t i = 0; i < list.size(); ++i) {
      std::string id = CheckedText(list[i], At(At(where, field), i));
      if (!seen.insert(id).second) {
        Fail(At(At(where, field), i), "\"" + id + "\" is listed twice");
      }
      ids.push_back(std::move(id));
    }
    return ids;
  }

  // The element's id, which no other element of the file may have.
  std::string NewId(const Json& object, const std::string& where) {
    std::string id = Text(object, f::kId, where, true);
    if (id.empty()) Fail(At(where, f::kId), "an empty unique id");
    if (model_->FindElement(id)) {
      Fail(At(where, f::kId), "the unique id \"" + id + "\" is used twice");
    }
    return id;
  }

  void Register(Element& element, const Json& object,
                const std::string& where) {
    model_->Register(element, NewId(object, where));
  }

  // Name, stereotype and tool properties.
  void ReadCommon(const Json& object, const std::string& where,
                  Element& element) {
    element.SetName(Text(object, f::kName, where, false));
    element.SetStereotype(Text(object, f::kStereotype, where, false));
    const Json& properties = Array(object, f::kToolProperties, where);
    for (size_t i = 0; i < properties.size(); ++i) {
      std::string at = At(At(where, f::kToolProperties), i);
      const Json& property = properties[i];
      Fields(property, at, {f::kTool, f::kName, f::kValue, f::kType});
      std::string tool = Text(property, f::kTool, at, true);
      std::string name = Text(property, f::kName, at, true);
      if (!element.CreateToolProperty(tool, name,
                                      Text(property, f::kValue, at, false),
                                      Text(property, f::kType, at, true))) {
        Fail(at, "the tool property " + tool + "/" + name + " is given twice");
      }
    }
  }

  // What both kinds of package hold: the common fields, the modifiable
  // flag, their items (components or classes, read by `read_item`) and the
  // packages inside, which hold the same.
  template <class Package, class ReadItem>
  void ReadPackage(const Json& object, const std::string& where,
                   Package& package, const char* items, ReadItem read_item) {
    Fields(object, where,
           {f::kId, f::kName, f::kStereotype, f::kToolProperties,
            f::kModifiable, items, f::kPackages});
    ReadCommon(object, where, package);
    package.SetModifiable(Bool(object, f::kModifiable, where, true));
    const Json& list = Array(object, items, where);
    for (size_t i = 0; i < list.size(); ++i) {
      std::string at = At(At(where, items), i);
      RequireObject(list[i], at);
      read_item(list[i], at, package);
    }
    const Json& packages = Array(object, f::kPackages, where);
    for (size_t i = 0; i < packages.size(); ++i) {
      std::string at = At(At(where, f::kPackages), i);
      RequireObject(packages[i], at);
      auto inner = package.NewPackage(Text(packages[i], f::kName, at, false),
                                      NewId(packages[i], at));
      ReadPackage(packages[i], at, *inner, items, read_item);
    }
  }

  void ReadComponent(const Json& item, const std::string& at,
                     ComponentPackage& package) {
    Fields(item, at,
           {f::kId, f::kName, f::kStereotype, f::kToolProperties, f::kLanguage,
            f::kClasses, f::kDependencies});
    auto component =
        package.NewComponent(Text(item, f::kName, at, false), NewId(item, at));
    ReadCommon(item, at, *component);
    component->SetLanguage(Text(item, f::kLanguage, at, false));
    component_classes_.push_back({component, Ids(item, f::kClasses, at), at});
    const Json& dependencies = Array(item, f::kDependencies, at);
    for (size_t d = 0; d < dependencies.size(); ++d) {
      dependencies_.push_back(
          {component, &dependencies[d], At(At(at, f::kDependencies), d)});
    }
  }

  void ReadClassOf(const Json& item, const std::string& at,
                   LogicalPackage& package) {
    auto cls =
        package.NewClass(Text(item, f::kName, at, false), NewId(item, at));
    ReadClass(item, at, *cls);
  }

  void ReadClass(const Json& object, const std::string& where, Class& cls) {
    Fields(object, where,
           {f::kId, f::kName, f::kStereotype, f::kToolProperties,
            f::kComponents, f::kAddInName, f::kExcludedFromSelection,
            f::kAttributes, f::kOperations, f::kHasRelationships,
            f::kInheritRelations, f::kRealizeRelations});
    ReadCommon(object, where, cls);
    class_components_.push_back(
        {cls.Self(), Ids(object, f::kComponents, where), where});
    cls.SetAddInName(Text(object, f::kAddInName, where, false));
    cls.SetExcludedFromSelection(
        Bool(object, f::kExcludedFromSelection, where, false));

    const Json& attributes = Array(object, f::kAttributes, where);
    for (size_t i = 0; i < attributes.size(); ++i) {
      std::string at = At(At(where, f::kAttributes), i);
      const Json& item = attributes[i];
      Fields(item, at,
             {f::kId, f::kName, f::kStereotype, f::kToolProperties, f::kType,
              f::kInitialValue});
      auto attribute =
          cls.NewAttribute(Text(item, f::kName, at, false), NewId(item, at));
      ReadCommon(item, at, *attribute);
      attribute->SetType(Text(item, f::kType, at, false));
      attribute->SetInitialValue(Text(item, f::kInitialValue, at, false));
    }
    const Json& operations = Array(object, f::kOperations, where);
    for (size_t i = 0; i < operations.size(); ++i) {
      std::string at = At(At(where, f::kOperations), i);
      const Json& item = operations[i];
      Fields(item, at,
             {f::kId, f::kName, f::kStereotype, f::kToolProperties,
              f::kReturnType, f::kParameters});
      auto operation =
          cls.NewOperation(Text(item, f::kName, at, false), NewId(item, at));
      ReadCommon(item, at, *operation);
      operation->SetReturnType(Text(item, f::kReturnType, at, false));
      const Json& parameters = Array(item, f::kParameters, at);
      for (size_t p = 0; p < parameters.size(); ++p) {
        std::string pat = At(At(at, f::kParameters), p);
        const Json& one = parameters[p];
        Fields(one, pat,
               {f::kId, f::kName, f::kStereotype, f::kToolProperties, f::kType,
                f::kDefaultValue});
        auto parameter = operation->NewParameter(
            Text(one, f::kName, pat, false), Text(one, f::kType, pat, false),
            NewId(one, pat));
        ReadCommon(one, pat, *parameter);
        parameter->SetDefaultValue(Text(one, f::kDefaultValue, pat, false));
      }
    }
    ReadRelations(object, f::kHasRelationships, where,
                  [&](auto&&... a) { return cls.NewHasRelationship(a...); });
    ReadRelations(object, f::kInheritRelations, where,
                  [&](auto&&... a) { return cls.NewInheritRelation(a...); });
    ReadRelations(object, f::kRealizeRelations, where,
                  [&](auto&&... a) { return cls.NewRealizeRelation(a...); });
  }

  template <class Make>
  void ReadRelations(const Json& object, const char* field,
                     const std::string& where, Make make) {
    const Json& relations = Array(object, field, where);
    for (size_t i = 0; i < relations.size(); ++i) {
      std::string at = At(At(where, field), i);
      const Json& item = relations[i];
      Fields(item, at,
             {f::kId, f::kName, f::kStereotype, f::kToolProperties,
              f::kSupplier, f::kSupplierName});
      std::string supplier = Text(item, f::kSupplier, at, false);
      std::string supplier_name = Text(item, f::kSupplierName, at, false);
      if (Field(item, f::kSupplier) && Field(item, f::kSupplierName)) {
        Fail(at, "a relation has a supplier id or a supplier name, not both");
      }
      std::shared_ptr<ClassRelation> relation =
          make(Text(item, f::kName, at, false), nullptr, supplier_name,
               NewId(item, at));
      ReadCommon(item, at, *relation);
      if (Field(item, f::kSupplier)) {
        suppliers_.push_back({relation, supplier, At(at, f::kSupplier)});
      }
    }
  }

  template <class T>
  std::shared_ptr<T> Resolve(const std::string& id, const std::string& where,
                             const char* kind) {
    auto element = model_->FindElement(id);
    auto found = std::dynamic_pointer_cast<T>(element);
    if (!found) {
      Fail(where, element ? "\"" + id + "\" is a " + element->KindName() +
                                ", not a " + kind
                          : "no element has the unique id \"" + id + "\"");
    }
    return found;
  }

  // Each side keeps its own order; both sides must list the same pairs.
  void ResolveAssignments() {
    std::set<std::pair<std::string, std::string>> from_components;
    for (const auto& pending : component_classes_) {
      auto component = std::static_pointer_cast<Component>(pending.element);
      for (size_t i = 0; i < pending.ids.size(); ++i) {
        auto cls = Resolve<Class>(
            pending.ids[i], At(At(pending.where, f::kClasses), i), "Class");
        component->classes_.push_back(cls);
        from_components.emplace(component->UniqueId(), cls->UniqueId());
      }
    }
    size_t pairs = 0;
    for (const auto& pending : class_components_) {
      auto cls = std::static_pointer_cast<Class>(pending.element);
      for (size_t i = 0; i < pending.ids.size(); ++i) {
        std::string at = At(At(pending.where, f::kComponents), i);
        auto component = Resolve<Component>(pending.ids[i], at, "Module");
        if (!from_components.count({component->UniqueId(), cls->UniqueId()})) {
          Fail(at, "the component \"" + component->UniqueId() +
                       "\" does not list this class");
        }
        cls->components_.push_back(component);
        ++pairs;
      }
    }
    if (pairs != from_components.size()) {
      for (const auto& pending : component_classes_) {
        for (size_t i = 0; i < pending.ids.size(); ++i) {
          auto cls = model_->Find<Class>(pending.ids[i]);
          bool listed = false;
          for (const auto& weak : cls->components_) {
            listed = listed || weak.lock() == pending.element;
          }
          if (!listed) {
            Fail(At(At(pending.where, f::kClasses), i),
                 "the class \"" + pending.ids[i] +
                     "\" does not list this component");
          }
        }
      }
    }
  }

  void ResolveRelations() {
    for (const auto& pending : suppliers_) {
      pending.relation->SetSupplier(
          Resolve<Class>(pending.id, pending.where, "Class"));
    }
  }

  void ResolveDependencies() {
    for (const auto& pending : dependencies_) {
      const Json& item = *pending.value;
      const std::string& at = pending.where;
      Fields(
          item, at,
          {f::kId, f::kName, f::kStereotype, f::kToolProperties, f::kSupplier});
      auto supplier = Resolve<Component>(Text(item, f::kSupplier, at, true),
                                         At(at, f::kSupplier), "Module");
      auto dependency = pending.client->NewDependency(
          supplier, Text(item, f::kName, at, false), NewId(item, at));
      ReadCommon(item, at, *dependency);
    }
  }

  void ReadAssociations(const Json& file) {
    const Json& associations = Array(file, f::kAssociations, "(file)");
    for (size_t i = 0; i < associations.size(); ++i) {
      std::string at = At(std::string(f::kAssociations), i);
      const Json& item = associations[i];
      Fields(item, at,
             {f::kId, f::kName, f::kStereotype, f::kToolProperties, f::kRoles});
      const Json& roles = Array(item, f::kRoles, at);
      if (roles.size() != 2) Fail(at, "an association has exactly two roles");
      std::shared_ptr<Class> ends[2];
      std::string role_ids[2];
      for (size_t r = 0; r < 2; ++r) {
        std::string rat = At(At(at, f::kRoles), r);
        Fields(roles[r], rat,
               {f::kId, f::kName, f::kStereotype, f::kToolProperties, f::kClass,
                f::kNavigable, f::kCardinality, f::kAggregate});
        ends[r] = Resolve<Class>(Text(roles[r], f::kClass, rat, true),
                                 At(rat, f::kClass), "Class");
        role_ids[r] = NewId(roles[r], rat);
      }
      std::string id = NewId(item, at);
      if (role_ids[0] == role_ids[1] || role_ids[0] == id ||
          role_ids[1] == id) {
        Fail(at, "the association and its roles need three unique ids");
      }
      auto association = model_->MakeAssociation(
          ends[0], ends[1], Text(item, f::kName, at, false), id, role_ids[0],
          role_ids[1]);
      ReadCommon(item, at, *association);
      const std::shared_ptr<Role> made[2] = {association->Role1(),
                                             association->Role2()};
      for (size_t r = 0; r < 2; ++r) {
        std::string rat = At(At(at, f::kRoles), r);
        ReadCommon(roles[r], rat, *made[r]);
        made[r]->SetNavigable(Bool(roles[r], f::kNavigable, rat, true));
        made[r]->SetCardinality(Text(roles[r], f::kCardinality, rat, false));
        made[r]->SetAggregate(Bool(roles[r], f::kAggregate, rat, false));
      }
    }
  }

  void ReadSelection(const Json& file) {
    const Json* selection = Field(file, f::kSelection);
    if (!selection) return;
    const std::string where = f::kSelection;
    Fields(*selection, where,
           {f::kComponents, f::kComponentPackages, f::kClasses,
            f::kLogicalPackages});
    auto select = [&]<class T>(const char* field, const char* kind) {
      auto ids = Ids(*selection, field, where);
      for (size_t i = 0; i < ids.size(); ++i) {
        model_->Select(Resolve<T>(ids[i], At(At(where, field), i), kind));
      }
    };
    select.template operator()<Component>(f::kComponents, "Module");
    select.template operator()<ComponentPackage>(f::kComponentPackages,
                                                 "ComponentPackage");
    select.template operator()<Class>(f::kClasses, "Class");
    select.template operator()<LogicalPackage>(f::kLogicalPackages,
                                               "LogicalPackage");
  }

  std::string file_name_;
  std::shared_ptr<Model> model_;
  std::vector<PendingIds> component_classes_;
  std::vector<PendingIds> class_components_;
  std::vector<PendingSupplier> suppliers_;
  std::vector<PendingDependency> dependencies_;
};

std::shared_ptr<Model> ModelReader::ReadFile(const std::string& path,
                                             UniqueIdGenerator generator) {
  std::string text = ReadWholeFile(path, kMaxFileSize);
  auto model = ReadText(text, path, std::move(generator));
  model->file_path_ = path;
  return model;
}

std::shared_ptr<Model> ModelReader::ReadText(std::string_view text,
                                             const std::string& file_name,
                                             UniqueIdGenerator generator) {
  if (text.size() > kMaxFileSize) {
    throw automation::Error(
        automation::kBadFileFormat,
        file_name + ": larger than " + std::to_string(kMaxFileSize) + " bytes");
  }
  if (NestingOf(text) > kMaxNesting) {
    throw automation::Error(automation::kBadFileFormat,
                            file_name + ": nested deeper than " +
                                std::to_string(kMaxNesting) + " levels");
  }
  Json file;
  try {
    file = Json::parse(text);
  } catch (const Json::parse_error& error) {
    throw automation::Error(automation::kBadFileFormat,
                            file_name + ": not valid JSON (byte " +
                                std::to_string(error.byte) + ")");
  }
  return Parser(file_name, std::move(generator)).Read(file);
}

}  // namespace host::modeltool
