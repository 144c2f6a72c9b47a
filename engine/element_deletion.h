// The last step of a project's deletion phase: removing from the model what
// a deletion selection holds, one log or error line per element.
#ifndef KELQLN_ENGINE_ELEMENT_DELETION_H_
#define KELQLN_ENGINE_ELEMENT_DELETION_H_

#include <string>

#include "reporting/kel_reporter_api.h"

namespace kelqln {

class kelSortedComponents;

// For each class entry of `language`'s components in `selection`: an entry
// without members deletes the class; otherwise each member is deleted by its
// kind (texts 30100 to 30104, 30114 and 30115 hold the modelling tool's kind
// names; a member of any other kind is left alone). A role whose association
// is navigable at both ends only stops being navigable; otherwise the whole
// association goes. Each deletion is logged with `done` appended, or, when
// the modelling tool answers that it did not delete, reported as an error
// with `failed` appended. Failures of the modelling tool reach the caller.
void DeleteSelectedElements(const kelSortedComponents& selection,
                            const std::string& language,
                            kelReporterApi& reporter, const std::string& done,
                            const std::string& failed);

}  // namespace kelqln

#endif  // KELQLN_ENGINE_ELEMENT_DELETION_H_
