#include "host/modeltool/class_relation.h"

#include <algorithm>
#include <utility>

#include "automation/error.h"
#include "host/modeltool/class.h"
#include "host/modeltool/model.h"

namespace host::modeltool {

std::string ClassRelation::SupplierName() const {
  auto supplier = Supplier();
  return supplier ? supplier->Name() : supplier_name_;
}

void ClassRelation::SetSupplier(const std::shared_ptr<Class>& supplier,
                                std::string supplier_name) {
  if (supplier && supplier->GetModel() != RequireModel()) {
    throw automation::Error(
        automation::kInvalidProcedureCall,
        "A relation's supplier is a class of the same model");
  }
  if (auto before = Supplier()) {
    std::erase_if(before->supplier_of_, [this](const auto& weak) {
      return weak.expired() || weak.lock().get() == this;
    });
  }
  supplier_ = supplier;
  supplier_name_ = supplier ? std::string() : std::move(supplier_name);
  if (supplier) {
    supplier->supplier_of_.push_back(
        std::static_pointer_cast<ClassRelation>(SharedElement()));
  }
}

}  // namespace host::modeltool
