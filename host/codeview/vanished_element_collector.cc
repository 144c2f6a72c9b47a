#include "host/codeview/vanished_element_collector.h"

#include "external/code_view.h"

namespace host::codeview {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace collector = external::code_view::collector;

void VanishedElementCollector::AddClass(const automation::Object& cls) {
  if (!cls || !listed_.insert(cls.get()).second) return;
  classes_->Items().Add(Variant(cls));
  auto entry = entry_of_.find(cls.get());
  if (entry == entry_of_.end()) return;
  int32_t position = 1;
  for (const Variant& item : entries_->Items()) {
    if (item.ObjectValue() == entry->second) break;
    ++position;
  }
  entries_->Items().Remove(position);
  entry_of_.erase(entry);
}

void VanishedElementCollector::AddMember(const automation::Object& owner,
                                         const automation::Object& member) {
  if (!owner || !member || listed_.count(owner.get()) != 0 ||
      !listed_.insert(member.get()).second) {
    return;
  }
  auto& entry = entry_of_[owner.get()];
  if (!entry) {
    entry = std::make_shared<VanishedMemberEntry>(owner);
    entries_->Items().Add(Variant(entry));
  }
  entry->AddMember(member);
}

const automation::MemberTable<VanishedElementCollector>&
VanishedElementCollector::Members() {
  static const automation::MemberTable<VanishedElementCollector> table(
      "VanishedElementCollector",
      {
          {collector::kVanishedClasses, "VanishedClasses",
           CallKind::kPropertyGet,
           [](VanishedElementCollector& self, Args&) {
             return Variant(self.classes_);
           }},
          {collector::kVanishedMembers, "VanishedMembers",
           CallKind::kPropertyGet,
           [](VanishedElementCollector& self, Args&) {
             return Variant(self.entries_);
           }},
      });
  return table;
}

}  // namespace host::codeview
