#include "platform/clock.h"

#include <gtest/gtest.h>

#include <cctype>
#include <memory>
#include <string>
#include <vector>

#include "automation/error.h"
#include "platform/manual_clock.h"

namespace platform {
namespace {

TEST(ManualClockTest, MovesOnlyWhenTold) {
  ManualClock clock;
  EXPECT_EQ(clock.SecondsSinceMidnight(), 0.0f);
  EXPECT_EQ(clock.DateTimeText(), "2000-01-01 00:00:00");
  EXPECT_EQ(clock.MonotonicSeconds(), 0.0);

  clock.Sleep(250);
  clock.Advance(1.5);
  clock.Sleep(0);
  clock.Sleep(1000);
  EXPECT_DOUBLE_EQ(clock.MonotonicSeconds(), 2.75);
  EXPECT_EQ(clock.Sleeps(), (std::vector<uint32_t>{250, 0, 1000}));
  EXPECT_EQ(clock.SleepCount(), 3u);
  EXPECT_EQ(clock.SleptMilliseconds(), 1250u);
  EXPECT_EQ(clock.SecondsSinceMidnight(), 0.0f) << "time of day stays as set";

  clock.SetSecondsSinceMidnight(3600.5f);
  clock.SetDateTimeText("2024-02-29 01:00:00");
  EXPECT_EQ(clock.SecondsSinceMidnight(), 3600.5f);
  EXPECT_EQ(clock.DateTimeText(), "2024-02-29 01:00:00");
  EXPECT_THROW(clock.Advance(-0.001), automation::Error);
  EXPECT_DOUBLE_EQ(clock.MonotonicSeconds(), 2.75);
}

TEST(ClockTest, FreeFunctionsAskTheCurrentClock) {
  auto manual = std::make_shared<ManualClock>();
  manual->SetSecondsSinceMidnight(45296.25f);
  manual->SetDateTimeText("2030-12-31 12:34:56");
  SetClock(manual);
  EXPECT_EQ(Timer(), 45296.25f);
  EXPECT_EQ(NowText(), "2030-12-31 12:34:56");
  Sleep(60000);
  EXPECT_DOUBLE_EQ(MonotonicSeconds(), 60.0);
  EXPECT_EQ(manual->SleepCount(), 1u);

  SetClock(nullptr);
  Sleep(20);
  EXPECT_EQ(manual->SleepCount(), 1u) << "the system clock is back";
}

TEST(ClockTest, SystemClockTellsLocalTime) {
  SetClock(nullptr);
  // Digits where the pattern has '0', the separators elsewhere.
  const std::string pattern = "0000-00-00 00:00:00";
  const std::string now = NowText();
  ASSERT_EQ(now.size(), pattern.size()) << now;
  for (size_t i = 0; i < now.size(); ++i) {
    EXPECT_TRUE(pattern[i] == '0' ? std::isdigit(now[i]) : now[i] == pattern[i])
        << now;
  }
  float timer = Timer();
  EXPECT_GE(timer, 0.0f);
  EXPECT_LT(timer, 86401.0f);
  double start = MonotonicSeconds();
  Sleep(30);
  EXPECT_GE(MonotonicSeconds() - start, 0.029);
}

}  // namespace
}  // namespace platform
