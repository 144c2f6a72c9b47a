#include "host/codeview/home_package.h"

namespace host::codeview {

std::shared_ptr<modeltool::LogicalPackage> FindHomePackage(
    const modeltool::Model& model, const modeltool::Component& component) {
  for (const auto& package : model.RootLogicalPackage()->Packages()) {
    if (package->Name() == component.Name()) return package;
  }
  return nullptr;
}

}  // namespace host::codeview
