// One model class of a selection, with the model elements (attributes,
// operations, roles, relations) selected in it. A class without members
// stands for the whole class.
#ifndef KELQLN_SELECTION_KEL_SORTED_CLASS_H_
#define KELQLN_SELECTION_KEL_SORTED_CLASS_H_

#include <memory>
#include <utility>

#include "automation/variant.h"
#include "selection/selection_collections.h"

namespace kelqln {

class kelSortedClass {
 public:
  kelSortedClass();

  // The model class; it belongs to the modelling tool.
  const automation::Object& Class() const { return class_; }
  void SetClass(automation::Object value) { class_ = std::move(value); }

  // The selected model elements, keyed by unique identifier; never null.
  const std::shared_ptr<ObjectCollection>& Members() const { return members_; }
  void SetMembers(std::shared_ptr<ObjectCollection> value);

  // Adds `element` under its unique identifier. False when that cannot be
  // done: the element is there already, is Nothing, or has no readable
  // identifier.
  bool AddMember(const automation::Object& element);

  // Removes the member with the element's unique identifier; False when
  // there is none or the identifier cannot be read.
  bool RemoveMember(const automation::Object& element);

 private:
  automation::Object class_;
  std::shared_ptr<ObjectCollection> members_;
};

}  // namespace kelqln

#endif  // KELQLN_SELECTION_KEL_SORTED_CLASS_H_
