#include "platform/message_pump.h"

#include <mutex>
#include <utility>

namespace platform {
namespace {

struct PumpState {
  std::mutex mutex;
  std::function<void()> hook;
};

PumpState& State() {
  static PumpState state;
  return state;
}

}  // namespace

void SetPumpHook(std::function<void()> hook) {
  PumpState& state = State();
  std::lock_guard lock(state.mutex);
  state.hook = std::move(hook);
}

void DoEvents() {
  PumpState& state = State();
  std::function<void()> hook;
  {
    std::lock_guard lock(state.mutex);
    hook = state.hook;
  }
  // Run unlocked: the hook may itself call DoEvents or replace the hook.
  if (hook) hook();
}

}  // namespace platform
