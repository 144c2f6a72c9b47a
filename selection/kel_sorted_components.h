// The model side of a run's selection: which model components, and which of
// their classes and members, one run works on. Components are filed by
// language, then by unique identifier, in the order they are met; classes
// that belong to no component go to the pseudo-component "Unassigned" of
// the language "Unassigned", and so do components without language. Every
// listing follows insertion order.
//
// Whether a component or class belongs in the selection is the language
// add-ins' call: their statement generators are asked (and kept, one per
// add-in name); without a generator the IncludeALLComponents flag answers.
// Classes whose stereotype the "ExcludeClassStereotypes" setting lists, and
// classes the modelling tool marks as excluded, are never added.
//
// A VC++ component's "interface" and "coclass" classes also belong to a
// MIDL component; a class that has none is assigned to the MIDL companion
// "<component>.idl", which is reused when a usable one exists in the
// component's package and otherwise created there (see AddComponent).
//
// What is not there comes back as a result (Nothing, False, an empty
// collection); AddComponentNoClasses answers Nothing on any failure. AddClass
// and the MIDL companion's steps go on past the modelling tool's failures,
// and a failing add-in has no statement generator. Every other failure of
// the modelling tool reaches the caller as automation::Error, and so does
// RemoveComponent without a component.
//
// Look-ups by component take constant time on average: the selection keeps
// an index of its entries by the exact unique identifier of their model
// components, in step with every addition and removal, and rebuilds it after
// an identity change (selection/identity_changes.h). An identifier changed
// in the model by anything else is not followed: such an entry is no longer
// found under its old identifier, nor yet under its new one.
#ifndef KELQLN_SELECTION_KEL_SORTED_COMPONENTS_H_
#define KELQLN_SELECTION_KEL_SORTED_COMPONENTS_H_

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

#include "automation/collection.h"
#include "automation/variant.h"
#include "selection/language_table.h"
#include "selection/selection_collections.h"

namespace kelqln {

class kelSortedComponents {
 public:
  // The language, and the key, of the pseudo-component.
  static constexpr char kUnassigned[] = "Unassigned";

  kelSortedComponents();
  kelSortedComponents(const kelSortedComponents&) = delete;
  kelSortedComponents& operator=(const kelSortedComponents&) = delete;

  // The answer when no statement generator can judge a component or class;
  // initially False.
  void SetIncludeALLComponents(bool value) { include_all_components_ = value; }

  // The languages in the order first met, without "Unassigned" and without
  // languages that hold no component.
  NameCollection GetIncludedLanguages() const;

  // GetComponents("Unassigned").
  std::shared_ptr<const SortedComponentCollection> GetUnassignedComponents()
      const;

  // The classes of the pseudo-component (live); a new empty collection when
  // there is no pseudo-component.
  std::shared_ptr<SortedClassCollection> GetUnassignedClasses() const;

  // The components of `language` ("" is "Unassigned"), as the selection
  // keeps them: later changes show. An unknown language gives a new empty
  // collection and is not registered.
  std::shared_ptr<const SortedComponentCollection> GetComponents(
      std::string_view language) const;

  // Files the component (when its statement generator, or the flag, agrees)
  // with all its assigned classes that are to be added; Nothing when it is
  // Nothing or refused. A VC++ component (stereotype other than "MIDL")
  // whose "interface" or "coclass" classes have no MIDL component gets its
  // MIDL companion, and those classes are assigned to it in the model and
  // filed under it.
  std::shared_ptr<kelSortedComponent> AddComponent(
      const automation::Object& component);

  // Files the component with no classes, without asking whether it belongs;
  // Nothing when it is Nothing or filed already.
  std::shared_ptr<kelSortedComponent> AddComponentNoClasses(
      const automation::Object& component);

  // Removes the component's entry, and its language when that is left
  // empty; a component without entry is ignored. Nothing is an error (91):
  // the pseudo-component is not removed this way.
  void RemoveComponent(const automation::Object& aOrelModule);

  // Adds the class to `entry`, or, without entry, to the entries of all the
  // components it is assigned to in the model (the pseudo-component when it
  // has none). A VC++ "interface" or "coclass" class without MIDL component
  // is assigned to the MIDL companion of its last component, which is filed
  // with all its classes. Failing steps are skipped.
  void AddClass(const automation::Object& lClass,
                const std::shared_ptr<kelSortedComponent>& entry = nullptr);

  // Adds the class to the entry of `lComponent` (filing the component when
  // it belongs); the new class entry, or Nothing.
  std::shared_ptr<kelSortedClass> AddClassInComponent(
      const automation::Object& lClass, const automation::Object& lComponent);

  // Removes the class from the entry of `lComponent` (the pseudo-component
  // for Nothing); like every look-up that files, this files a component
  // that has no entry yet when it belongs. With fRemoveComponentIfLast an
  // entry left without classes is removed -- except the pseudo-component,
  // which stays.
  void RemoveClassFromComponent(const automation::Object& lClass,
                                const automation::Object& lComponent,
                                bool fRemoveComponentIfLast = true);

  // RemoveClassFromComponent for every component the class is assigned to;
  // for a class without component, from the pseudo-component (kept even
  // when empty).
  void RemoveClassFromAllComponents(const automation::Object& lClass,
                                    bool fRemoveComponentIfLast = true);

  // AddComponent for each component of the model collection `lComponents`,
  // then AddClass for each class of `lClasses`.
  void SortComponents(const automation::Object& lComponents,
                      const automation::Object& lClasses);

  // The model's current selection: selected components, the components of
  // selected component packages, selected classes, the classes of selected
  // logical packages, in this order.
  void SortSelection(const automation::Object& lModel);

  // Every component of the model, then the selected classes and the classes
  // of the selected logical packages.
  void SortSelectionAllComponents(const automation::Object& lModel);

  void GetAllComponentsAndClassesFromModel(const automation::Object& lModel);
  void GetAllComponentsFromModel(const automation::Object& lModel);
  void GetAllClassesFromModel(const automation::Object& lModel);

  // The first entry, in list order, whose model component has exactly the
  // unique identifier of `aOrelModule`; for Nothing, the pseudo-component.
  // Nothing when there is none.
  std::shared_ptr<kelSortedComponent> FindComponent(
      const automation::Object& aOrelModule);

  // The first entry whose model component has exactly this identifier.
  std::shared_ptr<kelSortedComponent> FindComponentFromUniqueID(
      std::string_view aComponentUniqueID);

  // The class entry of `aOrelClass` in the entry of `aOrelModule`.
  std::shared_ptr<kelSortedClass> FindClassInComponent(
      const automation::Object& aOrelClass,
      const automation::Object& aOrelModule);

  // The model class of the first entry, the pseudo-component included, that
  // holds a class with this identifier (letter case ignored); Nothing when
  // none does.
  automation::Object FindClass(std::string_view aClassUniqueID) const;

  bool IsClassInComponent(const automation::Object& aOrelClass,
                          const automation::Object& aOrelModule);

  // Removes the language "Unassigned": the pseudo-component and every
  // component without language.
  void RemoveAllUnassignedItems();

  // The model components of all entries that have one, in order, keyed by
  // unique identifier (a component filed twice is listed once).
  ObjectCollection GetAllOrelComponents() const;

  // A new selection filed afresh from the model: each entry's component
  // without classes, then each of its classes placed by the model's
  // assignments. Members, the flag and the caches are not copied.
  std::shared_ptr<kelSortedComponents> Clone() const;

  // Whether the pseudo-component holds a class.
  bool ContainsUnassignedClasses() const;

  // Whether `lClass` is to be added to the entry of `lComponent` (Nothing:
  // to the pseudo-component). Failures of the modelling tool reach the
  // caller.
  bool ShouldAddClass(const automation::Object& lComponent,
                      const automation::Object& lClass);

  // Takes from the pseudo-component every class whose package cannot be
  // changed.
  void RemoveAllUnmodifiableUnassignedClasses();

 private:
  using Language = LanguageEntries<kelSortedComponent>;
  using Placement = kelqln::Placement<kelSortedComponent>;
  struct MidlComponent {
    automation::Object component;
    bool created = false;
  };

  // The collection of `language`, registered when new.
  std::shared_ptr<SortedComponentCollection> LanguageComponents(
      const std::string& language);
  std::shared_ptr<kelSortedComponent> GetSortedComponent(
      const automation::Object& component);
  // Files a new entry for `component` in `components`, the collection of
  // `language`, under `key`; kDuplicateKey when the key is taken.
  std::shared_ptr<kelSortedComponent> File(
      const std::shared_ptr<SortedComponentCollection>& components,
      const automation::Object& component, const std::string& language,
      const std::string& key);
  std::shared_ptr<kelSortedComponent> FindPseudoComponent() const;
  bool ShouldAddComponent(const automation::Object& component);
  bool AskGenerator(const automation::Object& generator,
                    const automation::Object& component,
                    const automation::Object& item) const;
  automation::Object GetStatementGenerator(
      const automation::Object& application, const std::string& add_in_name);
  std::shared_ptr<kelSortedClass> AddClassToSortedComponent(
      const automation::Object& lClass,
      const std::shared_ptr<kelSortedComponent>& entry);
  void AddClassWithoutEntry(const automation::Object& lClass);
  MidlComponent GetMidlComponent(const automation::Object& component,
                                 const std::string& name) const;

  // The index: placements by the exact identifier of the entry's model
  // component, each list in filing order.
  void RefreshIndex();
  void RebuildIndex();
  // The placement of the first entry in list order whose component has
  // exactly `id` now, or null.
  const Placement* FindPlacement(std::string_view id);
  // Removes the entry of `placement`, found under `id`, with its language
  // when that is left empty.
  void Unfile(std::string_view id, const Placement& placement);

  bool include_all_components_ = false;
  ObjectCollection generators_;
  std::shared_ptr<automation::Collection> excluded_stereotypes_;
  LanguageTable<kelSortedComponent> languages_;
  std::unordered_map<std::string, std::vector<Placement>> by_unique_id_;
  std::optional<uint64_t> indexed_at_;
};

}  // namespace kelqln

#endif  // KELQLN_SELECTION_KEL_SORTED_COMPONENTS_H_
