// The interface through which another program starts an update: silently,
// with a callback that confirms deletions and hears when the run is over, or
// with the wizard. Both hand back the run's reporter.
#ifndef KELQLN_ENTRY_MODEL_UPDATE_H_
#define KELQLN_ENTRY_MODEL_UPDATE_H_

#include <memory>

#include "automation/variant.h"
#include "reporting/i_reporter.h"

namespace kelqln {

class ModelUpdate {
 public:
  virtual ~ModelUpdate() = default;

  // Runs the update over `Selection` without a window; `CallBack` (may be
  // Nothing) answers "OnSynchronize" and "OnCompleted". A run that fails
  // gives no reporter.
  virtual std::shared_ptr<IReporter> Start(automation::Object theOrelApp,
                                           automation::Object Selection,
                                           automation::Object CallBack) = 0;
  // Shows the wizard modally on `Selection` (may be Nothing).
  virtual std::shared_ptr<IReporter> StartVisible(
      automation::Object OrelApp, automation::Object Selection) = 0;
};

}  // namespace kelqln

#endif  // KELQLN_ENTRY_MODEL_UPDATE_H_
