// What a run reported: the reporter's four collections and the elements the
// run deleted from the model. Written with --report as JSON:
//
//   {"errors": [text], "warnings": [text], "logs": [text],
//    "summaries": [text],
//    "deleted": [{"kind": text, "owner": text, "name": text, "id": text}]}
#ifndef KELQLN_HOST_CLI_RUN_REPORT_H_
#define KELQLN_HOST_CLI_RUN_REPORT_H_

#include <string>
#include <vector>

#include "host/cli/element_summary.h"

namespace host::cli {

struct RunReport {
  std::vector<std::string> errors;
  std::vector<std::string> warnings;
  std::vector<std::string> logs;
  std::vector<std::string> summaries;
  std::vector<ElementSummary> deleted;

  // Replaces the file atomically; automation::Error naming the file when it
  // cannot be written.
  void Write(const std::string& path) const;
};

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_RUN_REPORT_H_
