#include "platform/message_box.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "platform/message_pump.h"

namespace platform {
namespace {

TEST(MessageBoxTest, HeadlessAnswersTheDefaultButton) {
  struct Case {
    uint32_t type;
    int32_t answer;
  };
  const std::vector<Case> cases = {
      {kMbOk, kIdOk},
      {kMbOk | kMbIconHand | kMbDefButton2, kIdOk},
      {kMbOkCancel | kMbDefButton2, kIdCancel},
      {kMbAbortRetryIgnore | kMbDefButton3, kIdIgnore},
      {kMbYesNoCancel | kMbIconQuestion | kMbDefButton2, kIdNo},
      {kMbYesNo | kMbDefButton2, kIdNo},
      {kMbYesNo | kMbDefButton3, kIdYes},
      {kMbRetryCancel | kMbDefButton2, kIdCancel},
      {kMbCancelTryContinue | kMbDefButton4, kIdCancel},
      {kMbCancelTryContinue | kMbDefButton3, kIdContinue},
  };
  SetMessageBoxHook(nullptr);
  for (const Case& test : cases) {
    testing::internal::CaptureStderr();
    EXPECT_EQ(MessageBox("Delete it?", "Update", test.type), test.answer)
        << std::hex << test.type;
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "Update: Delete it?\n");
  }
}

TEST(MessageBoxTest, HookAnswersInsteadUntilCleared) {
  std::vector<std::string> seen;
  SetMessageBoxHook([&seen](const std::string& text, const std::string& title,
                            uint32_t type) {
    seen.push_back(title + "|" + text + "|" + std::to_string(type));
    return kIdRetry;
  });
  testing::internal::CaptureStderr();
  EXPECT_EQ(MessageBox("t", "T", kMbYesNo | kMbIconQuestion), kIdRetry);
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
  EXPECT_EQ(seen, std::vector<std::string>{"T|t|36"});

  SetMessageBoxHook({});
  testing::internal::CaptureStderr();
  EXPECT_EQ(MessageBox("t", "T", kMbYesNo | kMbDefButton2), kIdNo);
  testing::internal::GetCapturedStderr();
  EXPECT_EQ(seen.size(), 1u);
}

TEST(MessagePumpTest, DoEventsRunsTheHookWhileSet) {
  int pumped = 0;
  DoEvents();
  SetPumpHook([&pumped] { ++pumped; });
  DoEvents();
  DoEvents();
  EXPECT_EQ(pumped, 2);
  // A hook may replace itself, as a closing window does.
  SetPumpHook([&pumped] {
    ++pumped;
    SetPumpHook({});
  });
  DoEvents();
  DoEvents();
  EXPECT_EQ(pumped, 3);
}

}  // namespace
}  // namespace platform
