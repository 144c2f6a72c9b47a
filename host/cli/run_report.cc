#include "host/cli/run_report.h"

#include <nlohmann/json.hpp>

#include "host/modeltool/atomic_file.h"

namespace host::cli {

void RunReport::Write(const std::string& path) const {
  nlohmann::json deleted_elements = nlohmann::json::array();
  for (const ElementSummary& element : deleted) {
    deleted_elements.push_back({{"kind", element.kind},
                                {"owner", element.owner},
                                {"name", element.name},
                                {"id", element.unique_id}});
  }
  nlohmann::json report = {{"errors", errors},
                           {"warnings", warnings},
                           {"logs", logs},
                           {"summaries", summaries},
                           {"deleted", deleted_elements}};
  modeltool::WriteFileAtomically(
      path,
      report.dump(1, ' ', false, nlohmann::json::error_handler_t::replace) +
          "\n");
}

}  // namespace host::cli
