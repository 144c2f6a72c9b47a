#include "host/modeltool/element.h"

#include <utility>

#include "automation/case_folding.h"
#include "automation/error.h"
#include "host/modeltool/application.h"
#include "host/modeltool/class.h"
#include "host/modeltool/element_collection.h"
#include "host/modeltool/model.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::RequiredArg;
using automation::Variant;
namespace orel = external::orel;

void Element::SetUniqueId(const std::string& id) {
  if (id == unique_id_) return;
  RequireModel()->ChangeUniqueId(*this, id);
}

std::shared_ptr<Model> Element::RequireModel() const {
  auto model = model_.lock();
  if (!model) {
    throw automation::Error(automation::kObjectNotSet,
                            "The " + std::string(KindName()) + " '" + name_ +
                                "' has been deleted from its model");
  }
  return model;
}

std::shared_ptr<ToolProperty> Element::FindToolProperty(
    std::string_view tool, std::string_view name) const {
  for (const auto& property : tool_properties_) {
    if (automation::EqualsIgnoreCase(property->Tool(), tool) &&
        automation::EqualsIgnoreCase(property->Name(), name)) {
      return property;
    }
  }
  return nullptr;
}

std::string Element::ToolPropertyValue(std::string_view tool,
                                       std::string_view name) const {
  auto property = FindToolProperty(tool, name);
  return property ? property->Value() : std::string();
}

bool Element::CreateToolProperty(std::string tool, std::string name,
                                 std::string value, std::string type) {
  if (FindToolProperty(tool, name)) return false;
  tool_properties_.push_back(std::make_shared<ToolProperty>(
      std::move(tool), std::move(name), std::move(value), std::move(type)));
  return true;
}

void Element::OverrideToolProperty(const std::string& tool,
                                   const std::string& name, std::string value) {
  if (auto property = FindToolProperty(tool, name)) {
    property->SetValue(std::move(value));
  } else {
    CreateToolProperty(tool, name, std::move(value));
  }
}

namespace {

Variant ContextClassOf(Element& self, Args&) {
  return Variant(self.ContextClass());
}

}  // namespace

const std::vector<ElementMember>& ElementMembers() {
  static const std::vector<ElementMember> members = {
      {orel::element::kName, "Name", CallKind::kPropertyGet,
       [](Element& self, Args&) { return Variant(self.Name()); }},
      {orel::element::kName, "Name", CallKind::kPropertyPut,
       [](Element& self, Args& args) {
         self.SetName(CStr(automation::PutValue(args)));
         return Variant();
       }},
      {orel::element::kUniqueId, "UniqueId", CallKind::kPropertyGet,
       [](Element& self, Args&) { return Variant(self.UniqueId()); }},
      {automation::kNamedOnly, orel::element::kSetUniqueId, CallKind::kMethod,
       [](Element& self, Args& args) {
         self.SetUniqueId(CStr(RequiredArg(args, 0)));
         return Variant();
       }},
      {orel::element::kKindName, "KindName", CallKind::kPropertyGet,
       [](Element& self, Args&) { return Variant(self.KindName()); }},
      {orel::element::kStereotype, "Stereotype", CallKind::kPropertyGet,
       [](Element& self, Args&) { return Variant(self.Stereotype()); }},
      {orel::element::kStereotype, "Stereotype", CallKind::kPropertyPut,
       [](Element& self, Args& args) {
         self.SetStereotype(CStr(automation::PutValue(args)));
         return Variant();
       }},
      {orel::element::kApplication, "Application", CallKind::kPropertyGet,
       [](Element& self, Args&) {
         auto model = self.GetModel();
         return Variant(model ? model->GetApplication() : nullptr);
       }},
      {automation::kNamedOnly, orel::element::kGetContextClass,
       CallKind::kMethod, ContextClassOf},
      {automation::kNamedOnly, orel::element::kParentClass,
       CallKind::kPropertyGet, ContextClassOf},
      {orel::element::kFindToolProperty, "FindToolProperty", CallKind::kMethod,
       [](Element& self, Args& args) {
         return Variant(self.FindToolProperty(CStr(RequiredArg(args, 0)),
                                              CStr(RequiredArg(args, 1))));
       }},
      {orel::element::kToolPropertyValue, "ToolPropertyValue",
       CallKind::kMethod,
       [](Element& self, Args& args) {
         return Variant(self.ToolPropertyValue(CStr(RequiredArg(args, 0)),
                                               CStr(RequiredArg(args, 1))));
       }},
      {orel::element::kCreateToolProperty, "CreateToolProperty",
       CallKind::kMethod,
       [](Element& self, Args& args) {
         return Variant(self.CreateToolProperty(
             CStr(RequiredArg(args, 0)), CStr(RequiredArg(args, 1)),
             CStr(RequiredArg(args, 2)),
             CStr(automation::OptionalArg(args, 3, "String"))));
       }},
      {orel::element::kOverrideToolProperty, "OverrideToolProperty",
       CallKind::kMethod,
       [](Element& self, Args& args) {
         self.OverrideToolProperty(CStr(RequiredArg(args, 0)),
                                   CStr(RequiredArg(args, 1)),
                                   CStr(RequiredArg(args, 2)));
         return Variant(true);
       }},
      {orel::element::kToolProperties, "ToolProperties", CallKind::kPropertyGet,
       [](Element& self, Args&) {
         return Variant(ElementCollection<ToolProperty>::Of(
             self.SharedElement(), self.ToolProperties()));
       }},
  };
  return members;
}

}  // namespace host::modeltool
