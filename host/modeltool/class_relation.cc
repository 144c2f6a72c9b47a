#include "host/modeltool/class_relation.h"

#include <algorithm>
#include <utility>

#include "host/modeltool/class.h"

namespace host::modeltool {

std::string ClassRelation::SupplierName() const {
  auto supplier = Supplier();
  return supplier ? supplier->Name() : supplier_name_;
}

void ClassRelation::SetSupplier(const std::shared_ptr<Class>& supplier,
                                std::string supplier_name) {
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
