// The code side of a run's selection: code-view projects filed by language,
// each bound to its model component, with the code-view components chosen
// in it. A project added with its model component is filed under that
// component's language and starts with all its code-view components; a
// code-view component whose project is not selected yet brings an entry
// without model component, filed under the project's own language. Every
// listing follows insertion order; languages match without regard to case,
// projects and components by identity, unique identifiers exactly.
//
// Look-ups by project and by unique identifier take constant time on
// average, through indexes kept in step with every addition and removal and
// rebuilt after an identity change (selection/identity_changes.h).
#ifndef KELQLN_SELECTION_KEL_SORTED_CV_PROJECTS_H_
#define KELQLN_SELECTION_KEL_SORTED_CV_PROJECTS_H_

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "automation/variant.h"
#include "selection/language_table.h"
#include "selection/selection_collections.h"

namespace kelqln {

class kelSortedCVProjects {
 public:
  kelSortedCVProjects();
  kelSortedCVProjects(const kelSortedCVProjects&) = delete;
  kelSortedCVProjects& operator=(const kelSortedCVProjects&) = delete;

  // The languages that hold projects, in the order first met.
  NameCollection GetIncludedLanguages() const;

  // The projects of `lLanguage` as the selection keeps them: a project
  // removed from the selection leaves this collection at once. An unknown
  // language gives a new empty collection and is not registered.
  std::shared_ptr<const SortedCVProjectCollection> GetProjects(
      std::string_view lLanguage) const;

  // A new entry for the project, filed under the language of
  // `lOrelComponent`, with an entry for each of the project's code-view
  // components; Nothing when the project is selected already. A project
  // may be Nothing (to be opened later). A missing model component is an
  // error (91).
  std::shared_ptr<kelSortedCVProject> AddProject(
      const automation::Object& lProject,
      const automation::Object& lOrelComponent);

  // Removes the project's entry, wherever it is filed, and its language
  // when that is left empty; no entry: nothing happens. Nothing is an
  // error (91).
  void RemoveProject(const automation::Object& lProject);

  // Removes, in every language, the first entry whose model component has
  // exactly this identifier.
  void RemoveProjectWithUniqueID(std::string_view sUniqueID);

  // Selects the code-view component in its project's entry (made, without
  // model component, when the project is not selected); the new entry, or
  // Nothing when the component is selected already. A component without
  // project is an error (91).
  std::shared_ptr<kelSortedCVComponent> AddComponentToProject(
      const automation::Object& anKelComponent);

  // Takes the code-view component out of its project's entry; the project
  // goes when it was its last component.
  void RemoveComponentFromProject(const automation::Object& anKelComponent);

  // Files each project of the code-view workspace under the model component
  // of the run's model (the OrelModel run global) that has the project's
  // unique identifier. A project without such component is left out and
  // written to the debug log; one selected already stays as it is.
  void SortProjects(const automation::Object& workspace);

  // The first entry, in list order, of the project (by identity); for
  // Nothing, the first entry without project.
  std::shared_ptr<kelSortedCVProject> FindProject(
      const automation::Object& aKelProject);

  // The first entry whose model component has exactly this identifier.
  std::shared_ptr<kelSortedCVProject> FindProjectWithUniqueID(
      std::string_view sUniqueID);

  // The entry of the code-view component in the entry of the project.
  std::shared_ptr<kelSortedCVComponent> FindComponentInProject(
      const automation::Object& anKelComponent,
      const automation::Object& anKelProject);

  bool IsComponentInProject(const automation::Object& anKelComponent,
                            const automation::Object& anKelProject);

 private:
  using Language = LanguageEntries<kelSortedCVProject>;
  // An entry's place; `key` is the identifier it is indexed under ("" for
  // an entry without model component).
  using Placement = kelqln::Placement<kelSortedCVProject>;

  void File(const std::shared_ptr<kelSortedCVProject>& entry,
            const std::string& language);
  void Unfile(const Placement& placement);
  void Index(const Placement& placement);

  void RefreshIndex();
  const Placement* FindPlacement(const automation::Object& project);
  // The placements whose model component has exactly `id` now, in list
  // order within each language.
  std::vector<const Placement*> PlacementsWithUniqueID(std::string_view id);

  LanguageTable<kelSortedCVProject> languages_;
  std::unordered_map<const automation::Dispatch*, std::vector<Placement>>
      by_project_;
  std::unordered_map<std::string, std::vector<Placement>> by_unique_id_;
  std::optional<uint64_t> indexed_at_;
};

}  // namespace kelqln

#endif  // KELQLN_SELECTION_KEL_SORTED_CV_PROJECTS_H_
