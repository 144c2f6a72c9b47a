// Where the classes a component's code brings into the model are put: a
// logical package named after the model component, directly below the root
// logical package, so each component's classes stay together and a class
// is found again by name in the same place.
#ifndef KELQLN_HOST_CODEVIEW_HOME_PACKAGE_H_
#define KELQLN_HOST_CODEVIEW_HOME_PACKAGE_H_

#include <memory>

#include "host/modeltool/component.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"

namespace host::codeview {

// The component's package, or nullptr when the model has none yet.
std::shared_ptr<modeltool::LogicalPackage> FindHomePackage(
    const modeltool::Model& model, const modeltool::Component& component);

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_HOME_PACKAGE_H_
