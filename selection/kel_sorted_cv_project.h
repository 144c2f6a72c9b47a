// One selected code-view project, bound to the model component it belongs
// to, with the code-view components selected in it. A project made from
// the code side has no model component.
#ifndef KELQLN_SELECTION_KEL_SORTED_CV_PROJECT_H_
#define KELQLN_SELECTION_KEL_SORTED_CV_PROJECT_H_

#include <cstdint>
#include <memory>
#include <string>
#include <utility>

#include "automation/variant.h"
#include "selection/construction_trace.h"
#include "selection/selection_collections.h"

namespace kelqln {

class kelSortedCVProject {
 public:
  kelSortedCVProject();
  kelSortedCVProject(automation::Object project,
                     automation::Object orel_component);
  ~kelSortedCVProject();
  kelSortedCVProject(const kelSortedCVProject&) = delete;
  kelSortedCVProject& operator=(const kelSortedCVProject&) = delete;

  // Kept for callers; never interpreted here.
  bool IsAllComponentsSelected() const { return all_components_selected_; }
  void SetIsAllComponentsSelected(bool value) {
    all_components_selected_ = value;
  }
  const std::string& ProjectFile() const { return project_file_; }
  void SetProjectFile(std::string value) { project_file_ = std::move(value); }
  int16_t ProjectType() const { return project_type_; }
  void SetProjectType(int16_t value) { project_type_ = value; }

  // The code-view project; the selection that holds the entry finds it
  // again by this object.
  const automation::Object& Project() const { return project_; }
  void SetProject(automation::Object value);

  // The selected code-view components, without keys; never null.
  const std::shared_ptr<SortedCVComponentCollection>& Components() const {
    return components_;
  }
  void SetComponents(std::shared_ptr<SortedCVComponentCollection> value);

  // The model component; the selection that holds the entry finds it again
  // by this component's unique identifier.
  const automation::Object& OrelComponent() const { return orel_component_; }
  void SetOrelComponent(automation::Object value);

  // The code-view component of every entry, in order.
  ObjectCollection GetCodeViewComponents() const;

  // AddMember on the entry of the code-view component; False without one.
  bool AddMemberInComponent(const automation::Object& anKelMember,
                            const automation::Object& anKelComponent);

  // RemoveMember on the entry of the code-view component; an entry left
  // without members goes. False when there is no entry or no such member.
  bool RemoveMemberFromComponent(const automation::Object& anKelMember,
                                 const automation::Object& anKelComponent);

  // The first entry of the code-view component (compared by identity).
  std::shared_ptr<kelSortedCVComponent> FindComponent(
      const automation::Object& lComponent) const;

  // Removes the first entry of the code-view component; none is no error.
  void RemoveComponent(const automation::Object& lComponent);

  // Opens the code-view project of the model component through its language
  // add-in's round-trip server and binds the two by unique identifier: a
  // project without identifier takes the component's; a component takes
  // the project's when no other model component has it, and otherwise both
  // keep theirs and the clash is reported to `lCodeView` as an error. Any
  // failure goes to the debug log. Returns the project (Nothing when it
  // could not be had, or the one held before when the add-in failed).
  automation::Object InitCodeViewProject(const automation::Object& lCodeView);

 private:
  // The position of the first entry of the code-view component, 0 if none.
  int32_t PositionOf(const automation::Object& lComponent) const;
  void ReportIdentifierClash(const automation::Object& lCodeView,
                             const automation::Object& holder,
                             const std::string& id) const;

  ConstructionTrace trace_;
  bool all_components_selected_ = false;
  std::string project_file_;
  int16_t project_type_ = 0;
  automation::Object project_;
  std::shared_ptr<SortedCVComponentCollection> components_;
  automation::Object orel_component_;
};

}  // namespace kelqln

#endif  // KELQLN_SELECTION_KEL_SORTED_CV_PROJECT_H_
