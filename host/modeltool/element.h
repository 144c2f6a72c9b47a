// What every model element has: name, unique identifier, stereotype, kind
// name and tool properties, and the late-bound members that go with them.
//
// Each concrete element class derives from ElementImpl<T> (and so from
// automation::DispatchImpl<T>): the element IS its automation object, so the
// same element always reaches callers as the same Object. Elements are made
// by their owners (a package makes its classes, a class its attributes...),
// which hold them by shared_ptr; an element points back to its owner and to
// its model with weak_ptrs. A deleted element is cut loose from its model:
// GetModel() gives nullptr and the members that need the model raise
// automation::kObjectNotSet.
#ifndef KELQLN_HOST_MODELTOOL_ELEMENT_H_
#define KELQLN_HOST_MODELTOOL_ELEMENT_H_

#include <initializer_list>
#include <memory>
#include <string>
#include <vector>

#include "automation/member_table.h"
#include "host/modeltool/tool_property.h"

namespace host::modeltool {

class Class;
class Model;

class Element {
 public:
  virtual ~Element() = default;
  Element(const Element&) = delete;
  Element& operator=(const Element&) = delete;

  // The tool's kind name ("Class", "Attribute", "Module"...).
  virtual const char* KindName() const = 0;
  virtual automation::Object AsObject() = 0;
  virtual std::shared_ptr<Element> SharedElement() = 0;
  // The class a member belongs to; nullptr for elements that are no member.
  virtual std::shared_ptr<Class> ContextClass() const { return nullptr; }

  const std::string& Name() const { return name_; }
  void SetName(std::string name) { name_ = std::move(name); }
  const std::string& UniqueId() const { return unique_id_; }
  // Gives the element another identifier, keeping the model's index right.
  // An empty id is kInvalidProcedureCall; an id another element of the model
  // has is kDuplicateKey.
  void SetUniqueId(const std::string& id);
  const std::string& Stereotype() const { return stereotype_; }
  void SetStereotype(std::string stereotype) {
    stereotype_ = std::move(stereotype);
  }

  // The model, or nullptr once the element has been deleted.
  std::shared_ptr<Model> GetModel() const { return model_.lock(); }
  // The model; kObjectNotSet once the element has been deleted.
  std::shared_ptr<Model> RequireModel() const;

  // Tool properties, found by tool and name without regard to case.
  std::shared_ptr<ToolProperty> FindToolProperty(std::string_view tool,
                                                 std::string_view name) const;
  // The value, or "" when the element has no such property.
  std::string ToolPropertyValue(std::string_view tool,
                                std::string_view name) const;
  // Adds the property; false (and nothing changes) when it exists already.
  bool CreateToolProperty(std::string tool, std::string name, std::string value,
                          std::string type = "String");
  // Sets the value, adding the property (type "String") when it is missing.
  void OverrideToolProperty(const std::string& tool, const std::string& name,
                            std::string value);
  const std::vector<std::shared_ptr<ToolProperty>>& ToolProperties() const {
    return tool_properties_;
  }

 protected:
  explicit Element(std::string name) : name_(std::move(name)) {}

 private:
  friend class Model;
  std::weak_ptr<Model> model_;
  std::string name_;
  std::string unique_id_;
  std::string stereotype_;
  std::vector<std::shared_ptr<ToolProperty>> tool_properties_;
};

// The base of each concrete element class T.
template <class T, class Base = Element>
class ElementImpl : public automation::DispatchImpl<T>, public Base {
 public:
  using Row = typename automation::MemberTable<T>::Row;

  automation::Object AsObject() override { return this->shared_from_this(); }
  std::shared_ptr<Element> SharedElement() override { return Self(); }
  std::shared_ptr<T> Self() {
    return std::static_pointer_cast<T>(this->shared_from_this());
  }

  // T's own member rows followed by the members every element has.
  static std::vector<Row> WithElementMembers(std::initializer_list<Row> own);

 protected:
  using Base::Base;
};

// One member every element answers, on the element's common part.
struct ElementMember {
  automation::DispId id;
  const char* name;
  automation::CallKind kind;
  automation::Variant (*handler)(Element& self, automation::Args& args);
};
const std::vector<ElementMember>& ElementMembers();

template <class T, class Base>
std::vector<typename ElementImpl<T, Base>::Row>
ElementImpl<T, Base>::WithElementMembers(std::initializer_list<Row> own) {
  std::vector<Row> rows(own);
  for (const ElementMember& member : ElementMembers()) {
    rows.push_back(
        {member.id, member.name, member.kind,
         [handler = member.handler](T& self, automation::Args& args) {
           return handler(self, args);
         }});
  }
  return rows;
}

// The element behind an argument: nullptr for Nothing or for an object that
// is no T; kObjectRequired for a value that is no object.
template <class T>
std::shared_ptr<T> ElementArg(const automation::Variant& value) {
  return std::dynamic_pointer_cast<T>(automation::CObj(value));
}

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_ELEMENT_H_
