// The library's creatable reporter classes, for its server module to list.
#ifndef KELQLN_REPORTING_REPORTER_CLASSES_H_
#define KELQLN_REPORTING_REPORTER_CLASSES_H_

#include <vector>

#include "automation/server_module.h"

namespace kelqln {

// APIProgress and shared_simplereporter under their programmatic and class
// identifiers.
std::vector<automation::ServerClass> ReporterServerClasses();

}  // namespace kelqln

#endif  // KELQLN_REPORTING_REPORTER_CLASSES_H_
