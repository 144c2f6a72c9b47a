// The collections the selection hands to its callers. They are the
// automation layer's keyed collections used directly from C++: numbered from
// 1, in insertion order, with text keys that match without regard to case
// and constant-time look-up by key. The engine and the wizard walk them with
// range-for or Item(i) and look entries up by key with Find.
//
// Collections that an object keeps (a sorted class's Members, a sorted
// component's Classes, a language's components) are held by shared_ptr and
// handed out live: a change through one holder is seen by all, as with the
// reference-counted collections of the original design. Collections built
// for one answer (GetIncludedLanguages, GetOrelClasses...) are returned by
// value.
#ifndef KELQLN_SELECTION_SELECTION_COLLECTIONS_H_
#define KELQLN_SELECTION_SELECTION_COLLECTIONS_H_

#include <memory>
#include <string>

#include "automation/basic_collection.h"
#include "automation/variant.h"

namespace kelqln {

class kelSortedClass;
class kelSortedComponent;
class kelSortedCVComponent;
class kelSortedCVProject;

// Model elements or code-view objects, keyed by unique identifier where the
// operation says so.
using ObjectCollection = automation::BasicCollection<automation::Object>;
// Language names, each keyed by itself.
using NameCollection = automation::BasicCollection<std::string>;
// A component's classes, keyed by the class's unique identifier.
using SortedClassCollection =
    automation::BasicCollection<std::shared_ptr<kelSortedClass>>;
// A language's components, keyed by the component's unique identifier (the
// pseudo-component by "Unassigned").
using SortedComponentCollection =
    automation::BasicCollection<std::shared_ptr<kelSortedComponent>>;
// A project's code-view components, without keys.
using SortedCVComponentCollection =
    automation::BasicCollection<std::shared_ptr<kelSortedCVComponent>>;
// A language's projects, without keys.
using SortedCVProjectCollection =
    automation::BasicCollection<std::shared_ptr<kelSortedCVProject>>;

}  // namespace kelqln

#endif  // KELQLN_SELECTION_SELECTION_COLLECTIONS_H_
