#include "selection/kel_sorted_cv_component.h"

#include "external/code_view.h"

namespace kelqln {

kelSortedCVComponent::kelSortedCVComponent() : kelSortedCVComponent(nullptr) {}

kelSortedCVComponent::kelSortedCVComponent(automation::Object component)
    : trace_("kelSortedCVComponent", this),
      component_(std::move(component)),
      members_(std::make_shared<ObjectCollection>()) {}

kelSortedCVComponent::~kelSortedCVComponent() {
  trace_.Release(component_, external::code_view::component::kName);
}

void kelSortedCVComponent::SetMembers(std::shared_ptr<ObjectCollection> value) {
  members_ = value ? std::move(value) : std::make_shared<ObjectCollection>();
}

bool kelSortedCVComponent::AddMember(const automation::Object& aMember) {
  if (!aMember || PositionOf(aMember) != 0) return false;
  members_->Add(aMember);
  return true;
}

bool kelSortedCVComponent::RemoveMember(const automation::Object& aMember) {
  int32_t position = PositionOf(aMember);
  if (position == 0) return false;
  members_->Remove(position);
  return true;
}

bool kelSortedCVComponent::IsMemberInComponent(
    const automation::Object& aMember) const {
  return PositionOf(aMember) != 0;
}

int32_t kelSortedCVComponent::PositionOf(
    const automation::Object& aMember) const {
  int32_t position = 0;
  for (const automation::Object& member : *members_) {
    ++position;
    if (member == aMember) return position;
  }
  return 0;
}

}  // namespace kelqln
