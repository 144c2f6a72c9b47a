// One model component of a selection with the classes selected in it. The
// pseudo-component "Unassigned" has no model component and holds the classes
// that belong to no component.
#ifndef KELQLN_SELECTION_KEL_SORTED_COMPONENT_H_
#define KELQLN_SELECTION_KEL_SORTED_COMPONENT_H_

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <utility>

#include "automation/variant.h"
#include "selection/selection_collections.h"

namespace kelqln {

class kelSortedComponent {
 public:
  kelSortedComponent();
  explicit kelSortedComponent(automation::Object component);

  // The model component; Nothing for the pseudo-component. The selection
  // that holds the entry finds it again by this component's identity.
  const automation::Object& Component() const { return component_; }
  void SetComponent(automation::Object value);

  // The selected classes, keyed by unique identifier; never null.
  const std::shared_ptr<SortedClassCollection>& Classes() const {
    return classes_;
  }
  void SetClasses(std::shared_ptr<SortedClassCollection> value);

  // Kept for callers; never interpreted here.
  const std::string& ProjectFile() const { return project_file_; }
  void SetProjectFile(std::string value) { project_file_ = std::move(value); }
  int16_t ProjectType() const { return project_type_; }
  void SetProjectType(int16_t value) { project_type_ = value; }

  // Removes the class entry under `key`; a missing key is ignored.
  void RemoveClass(std::string_view key);

  // Whether a class entry has that key (letter case ignored).
  bool IncludesClass(std::string_view key) const;

  // The model classes of all entries, in entry order, keyed by unique
  // identifier.
  ObjectCollection GetOrelClasses() const;

  // AddMember on the entry of `lClass`; False when the class has no entry
  // or the member cannot be added.
  bool AddMemberInClass(const automation::Object& member,
                        const automation::Object& lClass);

  // RemoveMember on the entry of `lClass`; an entry left without members is
  // removed. False when the class has no entry or the member was not there.
  bool RemoveMemberFromClass(const automation::Object& member,
                             const automation::Object& lClass);

 private:
  // The entry of `lClass`, or null when it has none.
  std::shared_ptr<kelSortedClass> EntryOf(const automation::Object& lClass,
                                          std::string* key) const;

  automation::Object component_;
  std::shared_ptr<SortedClassCollection> classes_;
  std::string project_file_;
  int16_t project_type_ = 0;
};

}  // namespace kelqln

#endif  // KELQLN_SELECTION_KEL_SORTED_COMPONENT_H_
