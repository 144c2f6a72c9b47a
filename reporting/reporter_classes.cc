#include "reporting/reporter_classes.h"

#include "reporting/api_progress.h"
#include "reporting/shared_simplereporter.h"

namespace kelqln {

std::vector<automation::ServerClass> ReporterServerClasses() {
  return {
      {APIProgress::kProgId, APIProgress::kClassId,
       [] { return APIProgress::Create(); }},
      {shared_simplereporter::kProgId, shared_simplereporter::kClassId,
       [] { return shared_simplereporter::Create(); }},
  };
}

}  // namespace kelqln
