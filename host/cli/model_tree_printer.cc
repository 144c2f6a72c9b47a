#include "host/cli/model_tree_printer.h"

#include <ostream>
#include <string>
#include <vector>

#include "host/modeltool/association.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/has_relationship.h"
#include "host/modeltool/inherit_relation.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"
#include "host/modeltool/operation.h"
#include "host/modeltool/parameter.h"
#include "host/modeltool/realize_relation.h"
#include "host/modeltool/role.h"

namespace host::cli {
namespace {

// The name followed by the stereotype, when the element has one.
std::string Titled(const modeltool::Element& element) {
  if (element.Stereotype().empty()) return element.Name();
  return element.Name() + " <<" + element.Stereotype() + ">>";
}

std::string Typed(const std::string& name, const std::string& type) {
  return type.empty() ? name : name + " : " + type;
}

std::string Joined(const std::vector<std::string>& parts) {
  std::string text;
  for (const std::string& part : parts) {
    if (part.empty()) continue;
    text += (text.empty() ? "" : ", ") + part;
  }
  return text;
}

std::string Signature(const modeltool::Operation& operation) {
  std::vector<std::string> parameters;
  for (const auto& parameter : operation.Parameters()) {
    parameters.push_back(Typed(parameter->Name(), parameter->Type()));
  }
  return Typed(Titled(operation) + "(" + Joined(parameters) + ")",
               operation.ReturnType());
}

std::string RoleText(const modeltool::Role& role) {
  auto target = role.GetClass();
  std::string text = (role.Name().empty() ? "" : role.Name() + " ") + "-> " +
                     (target ? target->Name() : "?");
  if (!role.Cardinality().empty()) text += " [" + role.Cardinality() + "]";
  auto association = role.GetAssociation();
  std::string notes = Joined({association && !association->Name().empty()
                                  ? "association " + association->Name()
                                  : "",
                              role.IsAggregate() ? "aggregate" : "",
                              role.IsNavigable() ? "" : "not navigable"});
  return notes.empty() ? text : text + " (" + notes + ")";
}

}  // namespace

void ModelTreePrinter::Print(const modeltool::Model& model) {
  Line(0, "Model " + model.Name());
  PrintPackage(*model.RootComponentPackage(), 0);
  PrintPackage(*model.RootLogicalPackage(), 0);
}

void ModelTreePrinter::PrintPackage(const modeltool::ComponentPackage& package,
                                    int depth) {
  Line(depth, (depth == 0 ? "" : "package ") + Titled(package));
  for (const auto& component : package.Components()) {
    std::string project =
        component->ToolPropertyValue(component->Language(), "ProjectFile");
    std::string about = Joined(
        {component->Language(), project.empty() ? "" : "project " + project});
    Line(depth + 1, "component " + Titled(*component) +
                        (about.empty() ? "" : " (" + about + ")"));
    for (const auto& cls : component->Classes()) {
      if (auto locked = cls.lock()) Line(depth + 2, "class " + locked->Name());
    }
  }
  for (const auto& inner : package.Packages()) PrintPackage(*inner, depth + 1);
}

void ModelTreePrinter::PrintPackage(const modeltool::LogicalPackage& package,
                                    int depth) {
  Line(depth, (depth == 0 ? "" : "package ") + Titled(package));
  for (const auto& cls : package.Classes()) PrintClass(*cls, depth + 1);
  for (const auto& inner : package.Packages()) PrintPackage(*inner, depth + 1);
}

void ModelTreePrinter::PrintClass(const modeltool::Class& cls, int depth) {
  Line(depth, "class " + Titled(cls));
  for (const auto& attribute : cls.Attributes()) {
    std::string text = Typed(Titled(*attribute), attribute->Type());
    if (!attribute->InitialValue().empty()) {
      text += " = " + attribute->InitialValue();
    }
    Line(depth + 1, "attribute " + text);
  }
  for (const auto& operation : cls.Operations()) {
    Line(depth + 1, "operation " + Signature(*operation));
  }
  for (const auto& has : cls.HasRelationships()) {
    Line(depth + 1, "has " + Typed(has->Name(), has->SupplierName()));
  }
  for (const auto& base : cls.InheritRelations()) {
    Line(depth + 1, "inherits " + base->SupplierName());
  }
  for (const auto& interface : cls.RealizeRelations()) {
    Line(depth + 1, "realizes " + interface->SupplierName());
  }
  for (const auto& role : cls.Roles()) {
    Line(depth + 1, "role " + RoleText(*role));
  }
}

void ModelTreePrinter::Line(int depth, const std::string& text) {
  out_ << std::string(2 * depth, ' ') << text << '\n';
}

}  // namespace host::cli
