#include "host/modeltool/operation.h"

#include <algorithm>
#include <utility>

#include "external/orel.h"
#include "host/modeltool/class.h"
#include "host/modeltool/element_collection.h"
#include "host/modeltool/model.h"
#include "host/modeltool/parameter.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

const char* Operation::KindName() const { return orel::kind::kOperation; }

std::shared_ptr<Parameter> Operation::NewParameter(
    std::string name, std::string type, const std::string& unique_id) {
  auto model = RequireModel();
  auto parameter = std::make_shared<Parameter>(std::move(name));
  model->Register(*parameter, unique_id);
  parameter->owner_ = Self();
  parameter->SetType(std::move(type));
  parameters_.push_back(parameter);
  return parameter;
}

bool Operation::DeleteParameter(std::shared_ptr<Parameter> parameter) {
  auto at = std::find(parameters_.begin(), parameters_.end(), parameter);
  if (!parameter || at == parameters_.end()) return false;
  parameters_.erase(at);
  RequireModel()->Forget(*parameter);
  return true;
}

const automation::MemberTable<Operation>& Operation::Members() {
  static const automation::MemberTable<Operation> table(
      "Operation",
      WithElementMembers({
          {orel::owner::kOfOperation, "OwnerClass", CallKind::kMethod,
           [](Operation& self, Args&) { return Variant(self.ContextClass()); }},
          {automation::kNamedOnly, "ReturnType", CallKind::kPropertyGet,
           [](Operation& self, Args&) { return Variant(self.return_type_); }},
          {automation::kNamedOnly, "ReturnType", CallKind::kPropertyPut,
           [](Operation& self, Args& args) {
             self.return_type_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
          {automation::kNamedOnly, "Parameters", CallKind::kPropertyGet,
           [](Operation& self, Args&) {
             return Variant(ElementCollection<Parameter>::Of(self.Self(),
                                                             self.parameters_));
           }},
      }));
  return table;
}

}  // namespace host::modeltool
