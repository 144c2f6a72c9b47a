#include "platform/clock.h"

#include <mutex>
#include <utility>

#include "platform/system_clock.h"

namespace platform {
namespace {

struct ClockState {
  std::mutex mutex;
  std::shared_ptr<Clock> clock = std::make_shared<SystemClock>();
};

ClockState& State() {
  static ClockState state;
  return state;
}

// A copy, so a clock replaced while a caller sleeps on it stays alive.
std::shared_ptr<Clock> Current() {
  ClockState& state = State();
  std::lock_guard lock(state.mutex);
  return state.clock;
}

}  // namespace

float Timer() { return Current()->SecondsSinceMidnight(); }

std::string NowText() { return Current()->DateTimeText(); }

double MonotonicSeconds() { return Current()->MonotonicSeconds(); }

void Sleep(uint32_t milliseconds) { Current()->Sleep(milliseconds); }

void SetClock(std::shared_ptr<Clock> clock) {
  if (clock == nullptr) clock = std::make_shared<SystemClock>();
  ClockState& state = State();
  std::lock_guard lock(state.mutex);
  state.clock = std::move(clock);
}

}  // namespace platform
