#include "entry/wizard_bridge.h"

#include <utility>

#include "automation/error.h"

namespace kelqln {
namespace {

std::shared_ptr<WizardBridge>& Installed() {
  static auto* bridge = new std::shared_ptr<WizardBridge>;  // outlives teardown
  return *bridge;
}

}  // namespace

void SetWizardBridge(std::shared_ptr<WizardBridge> bridge) {
  Installed() = std::move(bridge);
}

WizardBridge& Wizard() {
  if (!Installed()) {
    throw automation::Error(automation::kCannotCreateObject,
                            "The wizard is not available in this process",
                            "kelQLN");
  }
  return *Installed();
}

}  // namespace kelqln
