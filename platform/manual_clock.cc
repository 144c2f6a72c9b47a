#include "platform/manual_clock.h"

#include <numeric>
#include <utility>

#include "automation/error.h"

namespace platform {

float ManualClock::SecondsSinceMidnight() {
  std::lock_guard lock(mutex_);
  return seconds_since_midnight_;
}

std::string ManualClock::DateTimeText() {
  std::lock_guard lock(mutex_);
  return date_time_text_;
}

double ManualClock::MonotonicSeconds() {
  std::lock_guard lock(mutex_);
  return monotonic_seconds_;
}

void ManualClock::Sleep(uint32_t milliseconds) {
  std::lock_guard lock(mutex_);
  sleeps_.push_back(milliseconds);
  monotonic_seconds_ += milliseconds / 1000.0;
}

void ManualClock::SetSecondsSinceMidnight(float seconds) {
  std::lock_guard lock(mutex_);
  seconds_since_midnight_ = seconds;
}

void ManualClock::SetDateTimeText(std::string text) {
  std::lock_guard lock(mutex_);
  date_time_text_ = std::move(text);
}

void ManualClock::Advance(double seconds) {
  if (seconds < 0) {
    throw automation::Error(automation::kInvalidProcedureCall,
                            "A monotonic clock cannot go back");
  }
  std::lock_guard lock(mutex_);
  monotonic_seconds_ += seconds;
}

std::vector<uint32_t> ManualClock::Sleeps() const {
  std::lock_guard lock(mutex_);
  return sleeps_;
}

size_t ManualClock::SleepCount() const {
  std::lock_guard lock(mutex_);
  return sleeps_.size();
}

uint64_t ManualClock::SleptMilliseconds() const {
  std::lock_guard lock(mutex_);
  return std::accumulate(sleeps_.begin(), sleeps_.end(), uint64_t{0});
}

}  // namespace platform
