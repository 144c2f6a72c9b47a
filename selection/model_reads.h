// The modelling tool's members the selection reads, late-bound, in one
// place. Failures are the tool's errors, for the caller to handle.
#ifndef KELQLN_SELECTION_MODEL_READS_H_
#define KELQLN_SELECTION_MODEL_READS_H_

#include <string>
#include <vector>

#include "automation/dispatch.h"

namespace kelqln {

std::string UniqueIdOf(const automation::Object& element);
std::string NameOf(const automation::Object& element);
std::string StereotypeOf(const automation::Object& element);
std::string LanguageOf(const automation::Object& component);
automation::Object ApplicationOf(const automation::Object& element);

// The elements of a collection of the tool, in order, counted once before
// the walk.
std::vector<automation::Object> ModelItems(
    const automation::Object& collection);
// The elements of the collection that member `id` of `owner` gives.
std::vector<automation::Object> ItemsOf(const automation::Object& owner,
                                        automation::DispId id);

}  // namespace kelqln

#endif  // KELQLN_SELECTION_MODEL_READS_H_
