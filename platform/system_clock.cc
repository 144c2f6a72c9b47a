#include "platform/system_clock.h"

#include <chrono>
#include <ctime>
#include <thread>

namespace platform {
namespace {

struct LocalNow {
  std::tm fields;
  double fraction;  // of the current second
};

LocalNow Now() {
  auto now = std::chrono::system_clock::now();
  std::time_t seconds = std::chrono::system_clock::to_time_t(now);
  LocalNow local{};
  localtime_r(&seconds, &local.fields);
  local.fraction = std::chrono::duration<double>(
                       now - std::chrono::system_clock::from_time_t(seconds))
                       .count();
  return local;
}

}  // namespace

float SystemClock::SecondsSinceMidnight() {
  LocalNow now = Now();
  return static_cast<float>(now.fields.tm_hour * 3600 + now.fields.tm_min * 60 +
                            now.fields.tm_sec + now.fraction);
}

std::string SystemClock::DateTimeText() {
  LocalNow now = Now();
  char text[32];
  std::strftime(text, sizeof text, "%Y-%m-%d %H:%M:%S", &now.fields);
  return text;
}

double SystemClock::MonotonicSeconds() {
  return std::chrono::duration<double>(
             std::chrono::steady_clock::now().time_since_epoch())
      .count();
}

void SystemClock::Sleep(uint32_t milliseconds) {
  std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds));
}

}  // namespace platform
