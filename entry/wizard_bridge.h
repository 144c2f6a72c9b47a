// What the core asks of the wizard. The wizard lives in its own library,
// which the core does not link; that library installs its implementation
// when it is loaded, and a process without it (a host that only runs silent
// updates) gets a clear error instead of a window.
#ifndef KELQLN_ENTRY_WIZARD_BRIDGE_H_
#define KELQLN_ENTRY_WIZARD_BRIDGE_H_

#include <memory>

namespace kelqln {

class WizardBridge {
 public:
  virtual ~WizardBridge() = default;

  // Creates the wizard form if there is none and moves it to its summary
  // page.
  virtual void DisplaySummaryPage() = 0;
};

// Installs the wizard's implementation; nullptr removes it.
void SetWizardBridge(std::shared_ptr<WizardBridge> bridge);

// The installed wizard. Without one: "ActiveX component can't create
// object" (429), saying that the wizard is not available.
WizardBridge& Wizard();

}  // namespace kelqln

#endif  // KELQLN_ENTRY_WIZARD_BRIDGE_H_
