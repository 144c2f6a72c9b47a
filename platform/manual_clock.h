// A clock that moves only when told to, for tests of anything that reads the
// time or waits: Sleep returns at once and is recorded.
#ifndef KELQLN_PLATFORM_MANUAL_CLOCK_H_
#define KELQLN_PLATFORM_MANUAL_CLOCK_H_

#include <cstdint>
#include <mutex>
#include <string>
#include <vector>

#include "platform/clock.h"

namespace platform {

class ManualClock : public Clock {
 public:
  // Starts at midnight of 2000-01-01 with the monotonic time at zero.
  ManualClock() = default;

  float SecondsSinceMidnight() override;
  std::string DateTimeText() override;
  double MonotonicSeconds() override;
  // Moves the monotonic time by `milliseconds`; the time of day and the date
  // stay as set.
  void Sleep(uint32_t milliseconds) override;

  void SetSecondsSinceMidnight(float seconds);
  void SetDateTimeText(std::string text);
  // Moves the monotonic time without counting as a sleep; `seconds` below
  // zero throws kInvalidProcedureCall.
  void Advance(double seconds);

  // Each Sleep's milliseconds, in call order.
  std::vector<uint32_t> Sleeps() const;
  size_t SleepCount() const;
  uint64_t SleptMilliseconds() const;

 private:
  mutable std::mutex mutex_;
  float seconds_since_midnight_ = 0;
  std::string date_time_text_ = "2000-01-01 00:00:00";
  double monotonic_seconds_ = 0;
  std::vector<uint32_t> sleeps_;
};

}  // namespace platform

#endif  // KELQLN_PLATFORM_MANUAL_CLOCK_H_
