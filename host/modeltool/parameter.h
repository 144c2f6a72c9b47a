// A parameter of an operation.
#ifndef KELQLN_HOST_MODELTOOL_PARAMETER_H_
#define KELQLN_HOST_MODELTOOL_PARAMETER_H_

#include <memory>
#include <string>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Operation;

class Parameter : public ElementImpl<Parameter> {
 public:
  // Made by Operation::NewParameter.
  explicit Parameter(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<Parameter>& Members();
  const char* KindName() const override { return "Parameter"; }

  std::shared_ptr<Operation> GetOperation() const { return owner_.lock(); }
  const std::string& Type() const { return type_; }
  void SetType(std::string type) { type_ = std::move(type); }
  const std::string& DefaultValue() const { return default_value_; }
  void SetDefaultValue(std::string value) { default_value_ = std::move(value); }

 private:
  friend class Operation;
  friend class Model;
  std::weak_ptr<Operation> owner_;
  std::string type_;
  std::string default_value_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_PARAMETER_H_
