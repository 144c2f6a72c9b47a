#include "host/modeltool/add_in_manager.h"

#include <utility>

#include "automation/error.h"
#include "external/orel.h"
#include "host/modeltool/element_collection.h"

namespace host::modeltool {

void AddInManager::Add(std::shared_ptr<AddIn> add_in) {
  if (Find(add_in->Name())) {
    throw automation::Error(
        automation::kDuplicateKey,
        "An add-in named " + add_in->Name() + " is installed already");
  }
  add_ins_.push_back(std::move(add_in));
}

std::shared_ptr<AddIn> AddInManager::Find(std::string_view name) const {
  for (const auto& add_in : add_ins_) {
    if (add_in->Name() == name) return add_in;
  }
  return nullptr;
}

const automation::MemberTable<AddInManager>& AddInManager::Members() {
  static const automation::MemberTable<AddInManager> table(
      "AddInManager",
      {
          {external::orel::add_in_manager::kAddIns, "AddIns",
           automation::CallKind::kPropertyGet,
           [](AddInManager& self, automation::Args&) {
             return automation::Variant(ElementCollection<AddIn>::Of(
                 std::static_pointer_cast<AddInManager>(
                     self.shared_from_this()),
                 self.add_ins_));
           }},
      });
  return table;
}

}  // namespace host::modeltool
