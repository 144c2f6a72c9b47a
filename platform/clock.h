// Time as the system sees it: the wall clock, a monotonic clock and
// sleeping, all behind one replaceable clock so tests control time.
#ifndef KELQLN_PLATFORM_CLOCK_H_
#define KELQLN_PLATFORM_CLOCK_H_

#include <cstdint>
#include <memory>
#include <string>

namespace platform {

class Clock {
 public:
  virtual ~Clock() = default;

  // Local time of day in seconds, as a single-precision number.
  virtual float SecondsSinceMidnight() = 0;
  // Local date and time, "YYYY-MM-DD HH:MM:SS".
  virtual std::string DateTimeText() = 0;
  // Seconds from an arbitrary start; never goes back.
  virtual double MonotonicSeconds() = 0;
  virtual void Sleep(uint32_t milliseconds) = 0;
};

// These ask the current clock: the system clock unless SetClock chose
// another.
float Timer();
std::string NowText();
double MonotonicSeconds();
void Sleep(uint32_t milliseconds);

// Makes `clock` the current clock; nullptr restores the system clock.
void SetClock(std::shared_ptr<Clock> clock);

}  // namespace platform

#endif  // KELQLN_PLATFORM_CLOCK_H_
