// Asking the user, with the Windows message-box signature and answers. A
// graphical host installs a hook that shows a real box; without one the
// default button answers and the text goes to standard error.
#ifndef KELQLN_PLATFORM_MESSAGE_BOX_H_
#define KELQLN_PLATFORM_MESSAGE_BOX_H_

#include <cstdint>
#include <functional>
#include <string>

namespace platform {

// Button sets (the low four bits of the type).
constexpr uint32_t kMbOk = 0;
constexpr uint32_t kMbOkCancel = 1;
constexpr uint32_t kMbAbortRetryIgnore = 2;
constexpr uint32_t kMbYesNoCancel = 3;
constexpr uint32_t kMbYesNo = 4;
constexpr uint32_t kMbRetryCancel = 5;
constexpr uint32_t kMbCancelTryContinue = 6;
// Icons.
constexpr uint32_t kMbIconHand = 0x10;
constexpr uint32_t kMbIconQuestion = 0x20;
constexpr uint32_t kMbIconExclamation = 0x30;
constexpr uint32_t kMbIconAsterisk = 0x40;
// Default buttons; without one the first button is the default.
constexpr uint32_t kMbDefButton1 = 0;
constexpr uint32_t kMbDefButton2 = 0x100;
constexpr uint32_t kMbDefButton3 = 0x200;
constexpr uint32_t kMbDefButton4 = 0x300;

// Answers.
constexpr int32_t kIdOk = 1;
constexpr int32_t kIdCancel = 2;
constexpr int32_t kIdAbort = 3;
constexpr int32_t kIdRetry = 4;
constexpr int32_t kIdIgnore = 5;
constexpr int32_t kIdYes = 6;
constexpr int32_t kIdNo = 7;
constexpr int32_t kIdTryAgain = 10;
constexpr int32_t kIdContinue = 11;

using MessageBoxHook = std::function<int32_t(
    const std::string& text, const std::string& title, uint32_t type)>;

// Installs `hook`; an empty one restores the headless default.
void SetMessageBoxHook(MessageBoxHook hook);

int32_t MessageBox(const std::string& text, const std::string& title,
                   uint32_t type);

}  // namespace platform

#endif  // KELQLN_PLATFORM_MESSAGE_BOX_H_
