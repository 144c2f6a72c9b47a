#include "host/codeview/vanished_member_entry.h"

#include <utility>

#include "external/code_view.h"

namespace host::codeview {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace entry = external::code_view::collector_entry;

VanishedMemberEntry::VanishedMemberEntry(automation::Object owner)
    : owner_(std::move(owner)) {}

void VanishedMemberEntry::AddMember(automation::Object member) {
  members_->Items().Add(Variant(std::move(member)));
}

const automation::MemberTable<VanishedMemberEntry>&
VanishedMemberEntry::Members() {
  static const automation::MemberTable<VanishedMemberEntry> table(
      "VanishedMemberEntry",
      {
          {entry::kClass, "Class", CallKind::kPropertyGet,
           [](VanishedMemberEntry& self, Args&) {
             return Variant(self.owner_);
           }},
          {entry::kMembers, "Members", CallKind::kPropertyGet,
           [](VanishedMemberEntry& self, Args&) {
             return Variant(self.members_);
           }},
      });
  return table;
}

}  // namespace host::codeview
