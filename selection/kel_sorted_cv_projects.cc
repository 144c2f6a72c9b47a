#include "selection/kel_sorted_cv_projects.h"

#include <utility>

#include "automation/call.h"
#include "automation/collection.h"
#include "automation/error.h"
#include "entry/debug_log.h"
#include "entry/run_globals.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "selection/identity_changes.h"
#include "selection/kel_sorted_cv_component.h"
#include "selection/kel_sorted_cv_project.h"
#include "selection/model_reads.h"

namespace kelqln {
namespace {

namespace cv = external::code_view;
namespace orel = external::orel;
using automation::CObj;
using automation::CStr;
using automation::Get;
using automation::Object;

Object ProjectOf(const Object& code_view_component) {
  return CObj(Get(code_view_component, cv::component::kProject));
}

// Takes the placement of `entry` out of the index list under `key`.
template <class Index, class Key, class Entry>
void Forget(Index& index, const Key& key, const Entry& entry) {
  auto found = index.find(key);
  if (found == index.end()) return;
  std::erase_if(found->second, [&](const auto& placement) {
    return placement.entry == entry;
  });
  if (found->second.empty()) index.erase(found);
}

}  // namespace

kelSortedCVProjects::kelSortedCVProjects()
    : indexed_at_(IdentityChangeCount()) {}

NameCollection kelSortedCVProjects::GetIncludedLanguages() const {
  return IncludedLanguages(languages_);
}

std::shared_ptr<const SortedCVProjectCollection>
kelSortedCVProjects::GetProjects(std::string_view lLanguage) const {
  const Language* found = languages_.Find(lLanguage);
  return found ? found->entries : std::make_shared<SortedCVProjectCollection>();
}

std::shared_ptr<kelSortedCVProject> kelSortedCVProjects::AddProject(
    const Object& lProject, const Object& lOrelComponent) {
  if (lProject && FindProject(lProject)) return nullptr;
  std::string language = LanguageOf(lOrelComponent);
  auto entry = std::make_shared<kelSortedCVProject>(lProject, lOrelComponent);
  if (lProject) {
    for (const automation::Variant& component : automation::CollectionItems(
             CObj(Get(lProject, cv::project::kComponents)))) {
      entry->Components()->Add(
          std::make_shared<kelSortedCVComponent>(CObj(component)));
    }
  }
  File(entry, language);
  return entry;
}

void kelSortedCVProjects::RemoveProject(const Object& lProject) {
  if (!lProject) throw automation::Error(automation::kObjectNotSet);
  // Where the entry is found, not where the project's own language would
  // put it: a project filed under its component's language must leave too,
  // or a run that removes each project it has done would never end.
  if (const Placement* placement = FindPlacement(lProject)) Unfile(*placement);
}

void kelSortedCVProjects::RemoveProjectWithUniqueID(
    std::string_view sUniqueID) {
  std::vector<Placement> first_of_each_language;
  for (const Placement* placement : PlacementsWithUniqueID(sUniqueID)) {
    bool seen = false;
    for (const Placement& chosen : first_of_each_language) {
      seen = seen ||
             automation::EqualsIgnoreCase(chosen.language, placement->language);
    }
    if (!seen) first_of_each_language.push_back(*placement);
  }
  for (const Placement& placement : first_of_each_language) Unfile(placement);
}

std::shared_ptr<kelSortedCVComponent>
kelSortedCVProjects::AddComponentToProject(const Object& anKelComponent) {
  Object project = ProjectOf(anKelComponent);
  if (!project) throw automation::Error(automation::kObjectNotSet);
  if (IsComponentInProject(anKelComponent, project)) return nullptr;
  std::shared_ptr<kelSortedCVProject> entry;
  if (const Placement* placement = FindPlacement(project)) {
    entry = placement->entry;
  } else {
    entry = std::make_shared<kelSortedCVProject>(project, nullptr);
    File(entry, CStr(Get(project, cv::project::kLanguage)));
  }
  auto component = std::make_shared<kelSortedCVComponent>(anKelComponent);
  entry->Components()->Add(component);
  return component;
}

void kelSortedCVProjects::RemoveComponentFromProject(
    const Object& anKelComponent) {
  Object project = ProjectOf(anKelComponent);
  const Placement* placement = project ? FindPlacement(project) : nullptr;
  if (!placement || !placement->entry->FindComponent(anKelComponent)) return;
  if (placement->entry->Components()->Count() == 1) {
    Unfile(*placement);
  } else {
    placement->entry->RemoveComponent(anKelComponent);
  }
}

void kelSortedCVProjects::SortProjects(const Object& workspace) {
  Object model = GetOrelModel();
  Object components =
      model ? CObj(automation::Call(model, orel::model::kAllComponents))
            : nullptr;
  for (const automation::Variant& item : automation::CollectionItems(
           CObj(Get(workspace, cv::workspace::kProjects)))) {
    Object project = CObj(item);
    std::string id = CStr(Get(project, cv::project::kUniqueId));
    Object component =
        components && !id.empty()
            ? CObj(automation::Call(components,
                                    orel::collection::kFindByUniqueId, id))
            : nullptr;
    if (!component) {
      DebugLog("kelQLN.SortProjects: no model component has the unique ID \"" +
                   id + "\" of project \"" +
                   CStr(Get(project, cv::project::kName)) + "\"",
               kDebugCategoryQln, kDebugLevelWarning);
      continue;
    }
    AddProject(project, component);
  }
}

std::shared_ptr<kelSortedCVProject> kelSortedCVProjects::FindProject(
    const Object& aKelProject) {
  const Placement* placement = FindPlacement(aKelProject);
  return placement ? placement->entry : nullptr;
}

std::shared_ptr<kelSortedCVProject>
kelSortedCVProjects::FindProjectWithUniqueID(std::string_view sUniqueID) {
  const Placement* placement =
      FirstInListOrder(languages_, PlacementsWithUniqueID(sUniqueID));
  return placement ? placement->entry : nullptr;
}

std::shared_ptr<kelSortedCVComponent>
kelSortedCVProjects::FindComponentInProject(const Object& anKelComponent,
                                            const Object& anKelProject) {
  auto entry = FindProject(anKelProject);
  return entry ? entry->FindComponent(anKelComponent) : nullptr;
}

bool kelSortedCVProjects::IsComponentInProject(const Object& anKelComponent,
                                               const Object& anKelProject) {
  return FindComponentInProject(anKelComponent, anKelProject) != nullptr;
}

void kelSortedCVProjects::File(const std::shared_ptr<kelSortedCVProject>& entry,
                               const std::string& language) {
  std::string key =
      entry->OrelComponent() ? UniqueIdOf(entry->OrelComponent()) : "";
  Language* found = languages_.Find(language);
  if (!found) {
    languages_.Add(
        Language{language, std::make_shared<SortedCVProjectCollection>()},
        language);
    found = languages_.Find(language);
  }
  found->entries->Add(entry);
  Index({entry, found->name, std::move(key)});
}

void kelSortedCVProjects::Unfile(const Placement& placement) {
  Placement removed = placement;  // `placement` may live in the index
  Language* language = languages_.Find(removed.language);
  int32_t position = 1;
  for (const auto& entry : *language->entries) {
    if (entry == removed.entry) break;
    ++position;
  }
  language->entries->Remove(position);  // the index knows it is there
  if (language->entries->Empty()) languages_.Remove(removed.language);
  Forget(by_project_, removed.entry->Project().get(), removed.entry);
  if (removed.entry->OrelComponent()) {
    Forget(by_unique_id_, removed.key, removed.entry);
  }
}

void kelSortedCVProjects::Index(const Placement& placement) {
  by_project_[placement.entry->Project().get()].push_back(placement);
  if (placement.entry->OrelComponent()) {
    by_unique_id_[placement.key].push_back(placement);
  }
}

void kelSortedCVProjects::RefreshIndex() {
  if (indexed_at_ == IdentityChangeCount()) return;
  indexed_at_.reset();
  by_project_.clear();
  by_unique_id_.clear();
  for (const Language& language : languages_) {
    for (const auto& entry : *language.entries) {
      const Object& component = entry->OrelComponent();
      Index({entry, language.name, component ? UniqueIdOf(component) : ""});
    }
  }
  indexed_at_ = IdentityChangeCount();
}

const kelSortedCVProjects::Placement* kelSortedCVProjects::FindPlacement(
    const Object& project) {
  RefreshIndex();
  auto found = by_project_.find(project.get());
  if (found == by_project_.end()) return nullptr;
  std::vector<const Placement*> placements;
  for (const Placement& placement : found->second) {
    placements.push_back(&placement);
  }
  return FirstInListOrder(languages_, placements);
}

std::vector<const kelSortedCVProjects::Placement*>
kelSortedCVProjects::PlacementsWithUniqueID(std::string_view id) {
  RefreshIndex();
  std::vector<const Placement*> placements;
  auto found = by_unique_id_.find(std::string(id));
  if (found == by_unique_id_.end()) return placements;
  // The identifier read now decides, as it would in a walk of the lists.
  for (const Placement& placement : found->second) {
    const Object& component = placement.entry->OrelComponent();
    if (component && UniqueIdOf(component) == id) {
      placements.push_back(&placement);
    }
  }
  return placements;
}

}  // namespace kelqln
