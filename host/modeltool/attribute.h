// An attribute of a class.
#ifndef KELQLN_HOST_MODELTOOL_ATTRIBUTE_H_
#define KELQLN_HOST_MODELTOOL_ATTRIBUTE_H_

#include <memory>
#include <string>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Attribute : public ElementImpl<Attribute> {
 public:
  // Made by Class::NewAttribute.
  explicit Attribute(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<Attribute>& Members();
  const char* KindName() const override;
  std::shared_ptr<Class> ContextClass() const override { return owner_.lock(); }

  const std::string& Type() const { return type_; }
  void SetType(std::string type) { type_ = std::move(type); }
  const std::string& InitialValue() const { return initial_value_; }
  void SetInitialValue(std::string value) { initial_value_ = std::move(value); }

 private:
  friend class Class;
  friend class Model;
  std::weak_ptr<Class> owner_;
  std::string type_;
  std::string initial_value_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_ATTRIBUTE_H_
