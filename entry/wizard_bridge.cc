#include "entry/wizard_bridge.h"

#include <utility>

#include "automation/error.h"

namespace kelqln {
namespace {

std::shared_ptr<WizardBridge>& Installed() {
  static auto* bridge = new std::shared_ptr<WizardBridge>;  // outlives teardown
  return *bridge;
}

[[noreturn]] void NotAvailable() {
  throw automation::Error(automation::kCannotCreateObject,
                          "The wizard is not available in this process",
                          "kelQLN");
}

}  // namespace

automation::Object WizardBridge::ProgressControl() { NotAvailable(); }
automation::Object WizardBridge::StatusControl() { NotAvailable(); }
automation::Object WizardBridge::ExplorerTree() { NotAvailable(); }
void WizardBridge::SetNewSelection(bool) { NotAvailable(); }
void WizardBridge::Load() { NotAvailable(); }
void WizardBridge::Show(int32_t) { NotAvailable(); }
void WizardBridge::Unload() { NotAvailable(); }
void WizardBridge::DisplaySynchronizePage(
    const std::shared_ptr<kelSortedComponents>&) {
  NotAvailable();
}
bool WizardBridge::SynchronizeConfirmed() { NotAvailable(); }
void WizardBridge::SetSynchronizeConfirmed(bool) { NotAvailable(); }
std::shared_ptr<kelSortedComponents> WizardBridge::SynchronizeChoice() {
  NotAvailable();
}

void SetWizardBridge(std::shared_ptr<WizardBridge> bridge) {
  Installed() = std::move(bridge);
}

WizardBridge& Wizard() {
  if (!Installed()) NotAvailable();
  return *Installed();
}

}  // namespace kelqln
