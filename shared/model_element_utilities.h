// Questions about model elements, answered through the modelling tool's
// automation objects: a class from its component's and its own name, the
// component that implements a component, the other end of an association;
// and two helpers of the wizard's window: pictures from icons and the
// minimum window size.
//
// Failures of the modelling tool's objects reach the caller as
// automation::Error, except in FindImplementsDependency, where any failure
// means "no such dependency".
#ifndef KELQLN_SHARED_MODEL_ELEMENT_UTILITIES_H_
#define KELQLN_SHARED_MODEL_ELEMENT_UTILITIES_H_

#include <cstdint>
#include <string_view>

#include "automation/variant.h"

namespace kelqln {

// Finds the class `class_name` of the component `component_name` in the
// application's current model. The component is the first of that name, else
// the first whose name or whose "COM" tool property "_OCAName" equals it
// without regard to letter case; a component implemented by another of the
// same name stands for that one. Returns True with both found; otherwise
// False, with `found_class` Nothing and `component` the component searched
// (Nothing when there is none). An empty component name is False at once.
bool FindClassByNames(const automation::Object& application,
                      std::string_view class_name,
                      std::string_view component_name,
                      automation::Object& found_class,
                      automation::Object& component);

// The component of the same name (in any letter case) that has an
// "Implements" dependency on `component`, or `component` itself.
automation::Object ResolveImplementingComponent(
    const automation::Object& component);

// The first component dependency of `candidate` whose supplier has the unique
// identifier of `component` (in any letter case), or Nothing.
automation::Object FindImplementsDependency(
    const automation::Object& candidate, const automation::Object& component);

// The role at the other end of the role's association.
automation::Object GetOtherRole(const automation::Object& role);

// A picture of type icon that owns `icon_handle`; Nothing for a handle of 0.
automation::Object IconToPicture(int32_t icon_handle);

// The system's standard exclamation icon as a picture, for warning signs.
automation::Object GetExclamationPicture();

// The wizard window's smallest size in pixels, 0 by 0 until set.
void SetMinWindowSize(int32_t width, int32_t height);
int32_t GetMinWindowWidth();
int32_t GetMinWindowHeight();

}  // namespace kelqln

#endif  // KELQLN_SHARED_MODEL_ELEMENT_UTILITIES_H_
