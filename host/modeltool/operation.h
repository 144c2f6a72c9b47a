// An operation of a class, with its parameters in order.
#ifndef KELQLN_HOST_MODELTOOL_OPERATION_H_
#define KELQLN_HOST_MODELTOOL_OPERATION_H_

#include <memory>
#include <string>
#include <vector>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Parameter;

class Operation : public ElementImpl<Operation> {
 public:
  // Made by Class::NewOperation.
  explicit Operation(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<Operation>& Members();
  const char* KindName() const override;
  std::shared_ptr<Class> ContextClass() const override { return owner_.lock(); }

  const std::string& ReturnType() const { return return_type_; }
  void SetReturnType(std::string type) { return_type_ = std::move(type); }

  std::shared_ptr<Parameter> NewParameter(std::string name,
                                          std::string type = "",
                                          const std::string& unique_id = "");
  // False when the parameter is not this operation's.
  bool DeleteParameter(std::shared_ptr<Parameter> parameter);
  const std::vector<std::shared_ptr<Parameter>>& Parameters() const {
    return parameters_;
  }

 private:
  friend class Class;
  friend class Model;
  std::weak_ptr<Class> owner_;
  std::string return_type_;
  std::vector<std::shared_ptr<Parameter>> parameters_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_OPERATION_H_
