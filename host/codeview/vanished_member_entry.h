// One entry of the vanished-element collector: a model class that stays,
// with those of its members (attributes, operations, roles, inherit,
// realize and has relations) that the code no longer has.
#ifndef KELQLN_HOST_CODEVIEW_VANISHED_MEMBER_ENTRY_H_
#define KELQLN_HOST_CODEVIEW_VANISHED_MEMBER_ENTRY_H_

#include <memory>

#include "automation/collection.h"
#include "automation/member_table.h"

namespace host::codeview {

class VanishedMemberEntry
    : public automation::DispatchImpl<VanishedMemberEntry> {
 public:
  explicit VanishedMemberEntry(automation::Object owner);

  static const automation::MemberTable<VanishedMemberEntry>& Members();

  const automation::Object& Owner() const { return owner_; }
  void AddMember(automation::Object member);

 private:
  automation::Object owner_;
  std::shared_ptr<automation::Collection> members_ =
      automation::Collection::Create();
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_VANISHED_MEMBER_ENTRY_H_
