// The machine's own clock: local time and real sleeping.
#ifndef KELQLN_PLATFORM_SYSTEM_CLOCK_H_
#define KELQLN_PLATFORM_SYSTEM_CLOCK_H_

#include "platform/clock.h"

namespace platform {

class SystemClock : public Clock {
 public:
  float SecondsSinceMidnight() override;
  std::string DateTimeText() override;
  double MonotonicSeconds() override;
  void Sleep(uint32_t milliseconds) override;
};

}  // namespace platform

#endif  // KELQLN_PLATFORM_SYSTEM_CLOCK_H_
