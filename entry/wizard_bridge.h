// What the core asks of the wizard. The wizard lives in its own library,
// which the core does not link; that library installs its implementation
// when it is loaded, and a process without it (a host that only runs silent
// updates) gets a clear error instead of a window.
//
// Every operation but DisplaySummaryPage has a default that raises the same
// error as a missing wizard, so a bridge that offers only part of the
// wizard (a test's, say) says plainly what it lacks.
#ifndef KELQLN_ENTRY_WIZARD_BRIDGE_H_
#define KELQLN_ENTRY_WIZARD_BRIDGE_H_

#include <cstdint>
#include <memory>

#include "automation/variant.h"

namespace kelqln {

class kelSortedComponents;

class WizardBridge {
 public:
  virtual ~WizardBridge() = default;

  // Creates the wizard form if there is none and moves it to its summary
  // page.
  virtual void DisplaySummaryPage() = 0;

  // The controls of the progress page that the run's reporter drives, and
  // the explorer tree of the selection page; the form is created if there
  // is none.
  virtual automation::Object ProgressControl();
  virtual automation::Object StatusControl();
  virtual automation::Object ExplorerTree();

  // Whether the wizard builds the selection itself, from the modelling
  // tool's current selection, when it loads.
  virtual void SetNewSelection(bool value);

  // Loads the form; shows it with `lMode` (1 modal: returns when the wizard
  // closes; 0 modeless: returns at once); unloads it and lets the form
  // instance go.
  virtual void Load();
  virtual void Show(int32_t lMode);
  virtual void Unload();

  // The synchronize page: shows the candidates for deletion; the user's
  // confirmation sets SynchronizeConfirmed, and SynchronizeChoice is then
  // what is to be deleted.
  virtual void DisplaySynchronizePage(
      const std::shared_ptr<kelSortedComponents>& candidates);
  virtual bool SynchronizeConfirmed();
  virtual void SetSynchronizeConfirmed(bool value);
  virtual std::shared_ptr<kelSortedComponents> SynchronizeChoice();
};

// Installs the wizard's implementation; nullptr removes it.
void SetWizardBridge(std::shared_ptr<WizardBridge> bridge);

// The installed wizard. Without one: "ActiveX component can't create
// object" (429), saying that the wizard is not available.
WizardBridge& Wizard();

}  // namespace kelqln

#endif  // KELQLN_ENTRY_WIZARD_BRIDGE_H_
