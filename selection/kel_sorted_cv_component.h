// One code-view component of a selected project, with the code-view members
// selected in it. Members are told apart by identity: the same object is in
// the collection at most once.
#ifndef KELQLN_SELECTION_KEL_SORTED_CV_COMPONENT_H_
#define KELQLN_SELECTION_KEL_SORTED_CV_COMPONENT_H_

#include <memory>
#include <utility>

#include "automation/variant.h"
#include "selection/construction_trace.h"
#include "selection/selection_collections.h"

namespace kelqln {

class kelSortedCVComponent {
 public:
  kelSortedCVComponent();
  explicit kelSortedCVComponent(automation::Object component);
  ~kelSortedCVComponent();
  kelSortedCVComponent(const kelSortedCVComponent&) = delete;
  kelSortedCVComponent& operator=(const kelSortedCVComponent&) = delete;

  const automation::Object& Component() const { return component_; }
  void SetComponent(automation::Object value) { component_ = std::move(value); }

  // The selected members, without keys; never null.
  const std::shared_ptr<ObjectCollection>& Members() const { return members_; }
  void SetMembers(std::shared_ptr<ObjectCollection> value);

  // Appends the member; False for Nothing or a member already there.
  bool AddMember(const automation::Object& aMember);
  // Removes the member; False when it is not there.
  bool RemoveMember(const automation::Object& aMember);
  bool IsMemberInComponent(const automation::Object& aMember) const;

 private:
  // The position of the member, 0 when it is not there.
  int32_t PositionOf(const automation::Object& aMember) const;

  ConstructionTrace trace_;
  automation::Object component_;
  std::shared_ptr<ObjectCollection> members_;
};

}  // namespace kelqln

#endif  // KELQLN_SELECTION_KEL_SORTED_CV_COMPONENT_H_
