// What vanished from the code during one project's update: model classes
// that no code class stands for any more, and, per class that stays, the
// members the code no longer has. The lists hold the model's own objects,
// so the caller can delete exactly those; nothing is deleted here.
//
// The system makes one collector per project with
// CreateObject("kelcv.VanishedElementCollector") and hands it to the code
// view's model updates.
#ifndef KELQLN_HOST_CODEVIEW_VANISHED_ELEMENT_COLLECTOR_H_
#define KELQLN_HOST_CODEVIEW_VANISHED_ELEMENT_COLLECTOR_H_

#include <memory>
#include <unordered_map>
#include <unordered_set>

#include "automation/collection.h"
#include "automation/member_table.h"
#include "host/codeview/vanished_member_entry.h"

namespace host::codeview {

class VanishedElementCollector
    : public automation::DispatchImpl<VanishedElementCollector> {
 public:
  static const automation::MemberTable<VanishedElementCollector>& Members();

  // Each class and each member is listed once however often it is added.
  // A member of a class listed as vanished is not listed again: the class
  // goes as a whole.
  void AddClass(const automation::Object& cls);
  void AddMember(const automation::Object& owner,
                 const automation::Object& member);

 private:
  std::shared_ptr<automation::Collection> classes_ =
      automation::Collection::Create();
  std::shared_ptr<automation::Collection> entries_ =
      automation::Collection::Create();
  std::unordered_set<const automation::Dispatch*> listed_;
  std::unordered_map<const automation::Dispatch*,
                     std::shared_ptr<VanishedMemberEntry>>
      entry_of_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_VANISHED_ELEMENT_COLLECTOR_H_
