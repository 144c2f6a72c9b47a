// Letting a user interface breathe during long work: DoEvents runs whatever
// the host installed (a graphical host processes its pending events).
#ifndef KELQLN_PLATFORM_MESSAGE_PUMP_H_
#define KELQLN_PLATFORM_MESSAGE_PUMP_H_

#include <functional>

namespace platform {

// Installs `hook`; an empty one leaves DoEvents doing nothing.
void SetPumpHook(std::function<void()> hook);

void DoEvents();

}  // namespace platform

#endif  // KELQLN_PLATFORM_MESSAGE_PUMP_H_
