// The selection a run hands to the system's Start: a collection of the
// model's components (by element) and of "component\class" texts, which
// the system resolves itself. Without any --select, every component of the
// model.
#ifndef KELQLN_HOST_CLI_RUN_SELECTION_H_
#define KELQLN_HOST_CLI_RUN_SELECTION_H_

#include <string>
#include <vector>

#include "automation/variant.h"

namespace host::modeltool {
class Model;
}  // namespace host::modeltool

namespace host::cli {

// A `select` without "\" names a component by its name or by its name
// qualified with its packages ("Pkg::Name"). UsageError for a component the
// model does not have, for a name two components share, and for a
// "component\class" text with an empty part.
automation::Object RunSelection(const modeltool::Model& model,
                                const std::vector<std::string>& selects);

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_RUN_SELECTION_H_
