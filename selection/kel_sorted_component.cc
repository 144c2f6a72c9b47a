#include "selection/kel_sorted_component.h"

#include "automation/error.h"
#include "selection/identity_changes.h"
#include "selection/kel_sorted_class.h"
#include "selection/model_reads.h"

namespace kelqln {

kelSortedComponent::kelSortedComponent() : kelSortedComponent(nullptr) {}

kelSortedComponent::kelSortedComponent(automation::Object component)
    : component_(std::move(component)),
      classes_(std::make_shared<SortedClassCollection>()) {}

void kelSortedComponent::SetComponent(automation::Object value) {
  if (value == component_) return;
  component_ = std::move(value);
  CountIdentityChange();
}

void kelSortedComponent::SetClasses(
    std::shared_ptr<SortedClassCollection> value) {
  classes_ =
      value ? std::move(value) : std::make_shared<SortedClassCollection>();
}

void kelSortedComponent::RemoveClass(std::string_view key) {
  if (classes_->Contains(key)) classes_->Remove(std::string(key));
}

bool kelSortedComponent::IncludesClass(std::string_view key) const {
  return classes_->Contains(key);
}

ObjectCollection kelSortedComponent::GetOrelClasses() const {
  ObjectCollection classes;
  for (const auto& entry : *classes_) {
    std::string id = UniqueIdOf(entry->Class());
    // An identifier changed in the model may meet another entry's; the
    // first entry keeps it.
    if (!classes.Contains(id)) classes.Add(entry->Class(), std::move(id));
  }
  return classes;
}

std::shared_ptr<kelSortedClass> kelSortedComponent::EntryOf(
    const automation::Object& lClass, std::string* key) const {
  *key = UniqueIdOf(lClass);
  std::shared_ptr<kelSortedClass>* entry = classes_->Find(*key);
  return entry ? *entry : nullptr;
}

bool kelSortedComponent::AddMemberInClass(const automation::Object& member,
                                          const automation::Object& lClass) {
  try {
    std::string key;
    auto entry = EntryOf(lClass, &key);
    return entry && entry->AddMember(member);
  } catch (const automation::Error&) {
    return false;  // a class without readable identifier has no entry
  }
}

bool kelSortedComponent::RemoveMemberFromClass(
    const automation::Object& member, const automation::Object& lClass) {
  try {
    std::string key;
    auto entry = EntryOf(lClass, &key);
    if (!entry || !entry->RemoveMember(member)) return false;
    if (entry->Members()->Empty()) classes_->Remove(key);
    return true;
  } catch (const automation::Error&) {
    return false;  // a class without readable identifier has no entry
  }
}

}  // namespace kelqln
