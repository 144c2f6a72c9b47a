#include "host/codeview/class_updater.h"

#include <utility>

#include "host/codeview/pairing.h"
#include "host/modeltool/association.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/has_relationship.h"
#include "host/modeltool/inherit_relation.h"
#include "host/modeltool/operation.h"
#include "host/modeltool/parameter.h"
#include "host/modeltool/realize_relation.h"
#include "host/modeltool/role.h"

namespace host::codeview {
namespace {

using modeltool::Attribute;
using modeltool::Class;
using modeltool::Element;
using modeltool::HasRelationship;
using modeltool::Operation;
using modeltool::Role;

std::string Quoted(const std::string& text) { return "\"" + text + "\""; }

std::string FlagText(bool flag) { return flag ? "true" : "false"; }

// Name and parameter types: what tells overloads apart.
std::string Signature(const std::string& name,
                      const std::vector<std::string>& types) {
  std::string text = name + "(";
  for (size_t i = 0; i < types.size(); ++i) {
    text += (i ? "," : "") + types[i];
  }
  return text + ")";
}

std::string SignatureOf(const CodeOperation& operation) {
  std::vector<std::string> types;
  for (const auto& parameter : operation.parameters) {
    types.push_back(parameter.type);
  }
  return Signature(operation.name, types);
}

std::string SignatureOf(const Operation& operation) {
  std::vector<std::string> types;
  for (const auto& parameter : operation.Parameters()) {
    types.push_back(parameter->Type());
  }
  return Signature(operation.Name(), types);
}

std::string ParameterList(const std::vector<CodeParameter>& parameters) {
  std::string text = "(";
  for (size_t i = 0; i < parameters.size(); ++i) {
    text += (i ? ", " : "") + parameters[i].name + ": " + parameters[i].type;
  }
  return text + ")";
}

std::vector<CodeParameter> ParametersOf(const Operation& operation) {
  std::vector<CodeParameter> list;
  for (const auto& parameter : operation.Parameters()) {
    list.push_back({parameter->Name(), parameter->Type()});
  }
  return list;
}

bool SameParameters(const std::vector<CodeParameter>& a,
                    const std::vector<CodeParameter>& b) {
  if (a.size() != b.size()) return false;
  for (size_t i = 0; i < a.size(); ++i) {
    if (a[i].name != b[i].name || a[i].type != b[i].type) return false;
  }
  return true;
}

// A class named by the code, with the model class it stands for.
struct Supplier {
  std::string name;
  std::shared_ptr<Class> target;
};

std::string IdOf(const std::shared_ptr<Class>& cls) {
  return cls ? cls->UniqueId() : "";
}

// A code role with the model class it points at.
struct ResolvedRole {
  const CodeRole* code;
  std::shared_ptr<Class> target;
};

// The end of an association the other class's code made, which this class's
// code has not declared: unnamed and not navigable.
bool IsFarEnd(const Role& role) {
  return role.Name().empty() && !role.IsNavigable();
}

std::string RoleKey(const std::string& name, const Class& target) {
  return name.empty() ? "" : name + '\x1f' + target.UniqueId();
}

}  // namespace

ClassUpdater::ClassUpdater(modeltool::Model& model, std::string tool,
                           ClassResolver resolve, const ReporterLink& reporter,
                           VanishedElementCollector& collector)
    : model_(model),
      tool_(std::move(tool)),
      resolve_(std::move(resolve)),
      reporter_(reporter),
      collector_(collector) {}

void ClassUpdater::Update(const CodeClass& code, Class& cls) {
  Sync(
      cls.Stereotype(), code.stereotype,
      [&cls](const std::string& text) { cls.SetStereotype(text); }, cls.Name(),
      "stereotype", true);
  UpdateAttributes(code, cls);
  UpdateOperations(code, cls);
  UpdateRelations(
      code.bases, cls.InheritRelations(),
      [&cls](const std::string& name, const std::shared_ptr<Class>& target) {
        cls.NewInheritRelation(name, target);
      },
      "inherit relation", cls);
  UpdateRelations(
      code.realizes, cls.RealizeRelations(),
      [&cls](const std::string& name, const std::shared_ptr<Class>& target) {
        cls.NewRealizeRelation(name, target);
      },
      "realize relation", cls);
  UpdateHas(code, cls);
  UpdateRoles(code, cls);
}

void ClassUpdater::Sync(const std::string& current, const std::string& wanted,
                        const std::function<void(const std::string&)>& set,
                        const std::string& subject, const char* property,
                        bool report) {
  if (current == wanted) return;
  std::string before = current;  // `set` may change what `current` refers to
  set(wanted);
  if (report) {
    Changed(subject + ": " + property + " changed from " + Quoted(before) +
            " to " + Quoted(wanted));
  }
}

void ClassUpdater::SyncVisibility(Element& element, const std::string& wanted,
                                  const std::string& subject, bool report) {
  Sync(
      element.ToolPropertyValue(tool_, kVisibilityProperty), wanted,
      [&](const std::string& text) {
        element.OverrideToolProperty(tool_, kVisibilityProperty, text);
      },
      subject, "visibility", report);
}

void ClassUpdater::Vanished(Class& cls, Element& member) {
  collector_.AddMember(cls.AsObject(), member.AsObject());
}

void ClassUpdater::UpdateAttributes(const CodeClass& code, Class& cls) {
  auto pairing = Pair<CodeAttribute, Attribute>(
      code.attributes, cls.Attributes(),
      {{[](const CodeAttribute& a) { return a.name; },
        [](const Attribute& a) { return a.Name(); }}});
  for (size_t i = 0; i < code.attributes.size(); ++i) {
    const CodeAttribute& wanted = code.attributes[i];
    auto attribute = pairing.element_of[i];
    bool known = attribute != nullptr;
    if (!known) {
      attribute = cls.NewAttribute(wanted.name);
      Changed(cls.Name() + ": attribute " + wanted.name + " added");
    }
    std::string subject = cls.Name() + "." + wanted.name;
    Sync(
        attribute->Type(), wanted.type,
        [&](const std::string& text) { attribute->SetType(text); }, subject,
        "type", known);
    Sync(
        attribute->InitialValue(), wanted.initial_value,
        [&](const std::string& text) { attribute->SetInitialValue(text); },
        subject, "initial value", known);
    SyncVisibility(*attribute, wanted.visibility, subject, known);
  }
  for (const auto& gone : pairing.unpaired) Vanished(cls, *gone);
}

void ClassUpdater::UpdateOperations(const CodeClass& code, Class& cls) {
  auto pairing = Pair<CodeOperation, Operation>(
      code.operations, cls.Operations(),
      {{[](const CodeOperation& o) { return SignatureOf(o); },
        [](const Operation& o) { return SignatureOf(o); }},
       {[](const CodeOperation& o) { return o.name; },
        [](const Operation& o) { return o.Name(); }}});
  for (size_t i = 0; i < code.operations.size(); ++i) {
    const CodeOperation& wanted = code.operations[i];
    auto operation = pairing.element_of[i];
    bool known = operation != nullptr;
    if (!known) {
      operation = cls.NewOperation(wanted.name);
      Changed(cls.Name() + ": operation " + wanted.name +
              ParameterList(wanted.parameters) + " added");
    }
    std::string subject = cls.Name() + "." + wanted.name;
    Sync(
        operation->ReturnType(), wanted.return_type,
        [&](const std::string& text) { operation->SetReturnType(text); },
        subject, "return type", known);
    SyncVisibility(*operation, wanted.visibility, subject, known);
    UpdateParameters(wanted, *operation, subject, known);
  }
  for (const auto& gone : pairing.unpaired) Vanished(cls, *gone);
}

void ClassUpdater::UpdateParameters(const CodeOperation& code,
                                    Operation& operation,
                                    const std::string& subject, bool report) {
  std::vector<CodeParameter> before = ParametersOf(operation);
  if (SameParameters(before, code.parameters)) return;
  // Parameters have no identity of their own in the code: the list is
  // written anew.
  while (!operation.Parameters().empty()) {
    operation.DeleteParameter(operation.Parameters().back());
  }
  for (const CodeParameter& parameter : code.parameters) {
    operation.NewParameter(parameter.name, parameter.type);
  }
  if (report) {
    Changed(subject + ": parameters changed from " + ParameterList(before) +
            " to " + ParameterList(code.parameters));
  }
}

template <class Relation, class Make>
void ClassUpdater::UpdateRelations(
    const std::vector<std::string>& suppliers,
    const std::vector<std::shared_ptr<Relation>>& present, Make make,
    const char* kind, Class& cls) {
  std::vector<Supplier> wanted;
  for (const std::string& name : suppliers) {
    wanted.push_back({name, resolve_(name)});
  }
  // By the class the relation points at, then by its name: a relation kept
  // by name is taken up once the model has the class.
  auto pairing = Pair<Supplier, Relation>(
      wanted, present,
      {{[](const Supplier& s) { return IdOf(s.target); },
        [](const Relation& r) { return IdOf(r.Supplier()); }},
       {[](const Supplier& s) { return s.name; },
        [](const Relation& r) { return r.SupplierName(); }}});
  for (size_t i = 0; i < wanted.size(); ++i) {
    const auto& [name, target] = wanted[i];
    auto relation = pairing.element_of[i];
    if (relation) {
      if (target && relation->Supplier() != target) {
        relation->SetSupplier(target);
        Changed(cls.Name() + ": " + kind + " to " + name +
                " now refers to the model's class " + target->Name());
      }
      continue;
    }
    if (!target) {
      reporter_.Warning(cls.Name() + ": " + name +
                        " is not a class of the model; no " + kind + " to it");
      continue;
    }
    make(target->Name(), target);
    Changed(cls.Name() + ": " + kind + " to " + target->Name() + " added");
  }
  for (const auto& gone : pairing.unpaired) Vanished(cls, *gone);
}

void ClassUpdater::UpdateHas(const CodeClass& code, Class& cls) {
  auto pairing = Pair<CodeHas, HasRelationship>(
      code.has, cls.HasRelationships(),
      {{[](const CodeHas& h) { return h.name; },
        [](const HasRelationship& h) { return h.Name(); }}});
  for (size_t i = 0; i < code.has.size(); ++i) {
    const CodeHas& wanted = code.has[i];
    auto relation = pairing.element_of[i];
    // A class outside the model (a library's) is kept by name.
    auto target = resolve_(wanted.class_name);
    std::string outside = target ? "" : wanted.class_name;
    if (!relation) {
      cls.NewHasRelationship(wanted.name, target, outside);
      Changed(cls.Name() + ": has-relationship " + wanted.name + " to " +
              wanted.class_name + " added");
      continue;
    }
    bool same = target ? relation->Supplier() == target
                       : !relation->Supplier() &&
                             relation->SupplierName() == wanted.class_name;
    if (same) continue;
    std::string before = relation->SupplierName();
    relation->SetSupplier(target, outside);
    Changed(cls.Name() + "." + wanted.name + ": class changed from " +
            Quoted(before) + " to " + Quoted(wanted.class_name) +
            (target ? " of the model" : " outside the model"));
  }
  for (const auto& gone : pairing.unpaired) Vanished(cls, *gone);
}

// Association ends are paired by role name and the class at that end; then
// by the association's name, so that the other class's end of the same
// association is taken up; then the far end of an association the other
// class's code made (unnamed, not navigable) is taken up by a role of the
// code pointing the same way, unless both name their association and the
// names differ. That makes one association navigable both ways, whichever
// class is updated first. Only navigable ends vanish: an end that cannot be
// followed is no member of the class's code.
void ClassUpdater::UpdateRoles(const CodeClass& code, Class& cls) {
  std::vector<ResolvedRole> wanted;
  for (const CodeRole& role : code.roles) {
    auto target = resolve_(role.class_name);
    if (!target) {
      reporter_.Warning(cls.Name() + ": " + role.class_name +
                        " is not a class of the model; no association for "
                        "role " +
                        role.name);
      continue;
    }
    wanted.push_back({&role, target});
  }
  auto pairing = Pair<ResolvedRole, Role>(
      wanted, cls.Roles(),
      {{[](const ResolvedRole& r) { return RoleKey(r.code->name, *r.target); },
        [](const Role& r) { return RoleKey(r.Name(), *r.GetClass()); }},
       {[](const ResolvedRole& r) {
          return RoleKey(r.code->association, *r.target);
        },
        [](const Role& r) {
          return RoleKey(r.GetAssociation()->Name(), *r.GetClass());
        }},
       {[](const ResolvedRole& r) { return r.target->UniqueId(); },
        [](const Role& r) {
          return IsFarEnd(r) && r.GetAssociation()->Name().empty()
                     ? r.GetClass()->UniqueId()
                     : std::string();
        }},
       {[](const ResolvedRole& r) {
          return r.code->association.empty() ? r.target->UniqueId()
                                             : std::string();
        },
        [](const Role& r) {
          return IsFarEnd(r) ? r.GetClass()->UniqueId() : std::string();
        }}});
  for (size_t i = 0; i < wanted.size(); ++i) {
    const CodeRole& code_role = *wanted[i].code;
    const auto& target = wanted[i].target;
    auto role = pairing.element_of[i];
    std::string subject = cls.Name() + "." + code_role.name;
    if (!role) {
      auto association =
          model_.NewAssociation(cls.Self(), target, code_role.association);
      association->Role1()->SetNavigable(false);
      role = association->Role2();
      role->SetName(code_role.name);
      role->SetCardinality(code_role.cardinality);
      role->SetAggregate(code_role.aggregate);
      Changed(cls.Name() + ": association end " + code_role.name + " to " +
              target->Name() + " added");
      continue;
    }
    if (IsFarEnd(*role)) {
      role->SetName(code_role.name);
      role->SetNavigable(true);
      Changed(cls.Name() + ": association end " + code_role.name + " to " +
              target->Name() + " added as the other end of an association");
    } else {
      Sync(
          role->Name(), code_role.name,
          [&](const std::string& text) { role->SetName(text); },
          cls.Name() + ": end to " + target->Name(), "role name", true);
      if (!role->IsNavigable()) {
        role->SetNavigable(true);
        Changed(subject + ": made navigable");
      }
    }
    auto association = role->GetAssociation();
    if (!code_role.association.empty()) {
      Sync(
          association->Name(), code_role.association,
          [&](const std::string& text) { association->SetName(text); }, subject,
          "association", true);
    }
    Sync(
        role->Cardinality(), code_role.cardinality,
        [&](const std::string& text) { role->SetCardinality(text); }, subject,
        "cardinality", true);
    if (role->IsAggregate() != code_role.aggregate) {
      role->SetAggregate(code_role.aggregate);
      Changed(subject + ": aggregate changed from " +
              FlagText(!code_role.aggregate) + " to " +
              FlagText(code_role.aggregate));
    }
  }
  for (const auto& gone : pairing.unpaired) {
    if (gone->IsNavigable()) Vanished(cls, *gone);
  }
}

}  // namespace host::codeview
