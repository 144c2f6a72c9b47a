#include "selection/kel_sorted_class.h"

#include <string>
#include <utility>

#include "automation/error.h"
#include "selection/model_reads.h"

namespace kelqln {

kelSortedClass::kelSortedClass()
    : members_(std::make_shared<ObjectCollection>()) {}

void kelSortedClass::SetMembers(std::shared_ptr<ObjectCollection> value) {
  members_ = value ? std::move(value) : std::make_shared<ObjectCollection>();
}

bool kelSortedClass::AddMember(const automation::Object& element) {
  try {
    std::string id = UniqueIdOf(element);
    members_->Add(element, std::move(id));
    return true;
  } catch (const automation::Error&) {
    return false;  // the caller learns it from the result
  }
}

bool kelSortedClass::RemoveMember(const automation::Object& element) {
  try {
    std::string id = UniqueIdOf(element);
    if (!members_->Contains(id)) return false;
    members_->Remove(id);
    return true;
  } catch (const automation::Error&) {
    return false;  // the caller learns it from the result
  }
}

}  // namespace kelqln
