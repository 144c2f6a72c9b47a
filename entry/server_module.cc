#include "entry/server_module.h"

#include <utility>
#include <vector>

#include "entry/api.h"
#include "reporting/reporter_classes.h"

namespace kelqln {

automation::ServerModule& KelQLNModule() {
  // Never destroyed: objects of the module may outlive static teardown.
  static auto* module = [] {
    std::vector<automation::ServerClass> classes{
        {API::kProgId, API::kClassId, [] { return API::Create(); }}};
    for (automation::ServerClass& reporter : ReporterServerClasses()) {
      classes.push_back(std::move(reporter));
    }
    return new automation::ServerModule(std::move(classes));
  }();
  return *module;
}

}  // namespace kelqln
