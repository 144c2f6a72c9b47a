#include "platform/message_box.h"

#include <iostream>
#include <mutex>
#include <utility>
#include <vector>

namespace platform {
namespace {

// The buttons of a button set, left to right; an unknown set shows OK.
std::vector<int32_t> Buttons(uint32_t type) {
  switch (type & 0xF) {
    case kMbOkCancel:
      return {kIdOk, kIdCancel};
    case kMbAbortRetryIgnore:
      return {kIdAbort, kIdRetry, kIdIgnore};
    case kMbYesNoCancel:
      return {kIdYes, kIdNo, kIdCancel};
    case kMbYesNo:
      return {kIdYes, kIdNo};
    case kMbRetryCancel:
      return {kIdRetry, kIdCancel};
    case kMbCancelTryContinue:
      return {kIdCancel, kIdTryAgain, kIdContinue};
    default:
      return {kIdOk};
  }
}

// A default button beyond the last one falls back to the first, as a real
// box does.
int32_t HeadlessMessageBox(const std::string& text, const std::string& title,
                           uint32_t type) {
  std::cerr << title << ": " << text << std::endl;
  std::vector<int32_t> buttons = Buttons(type);
  size_t default_index = (type & 0xF00) >> 8;
  return default_index < buttons.size() ? buttons[default_index] : buttons[0];
}

struct MessageBoxState {
  std::mutex mutex;
  MessageBoxHook hook = HeadlessMessageBox;
};

MessageBoxState& State() {
  static MessageBoxState state;
  return state;
}

}  // namespace

void SetMessageBoxHook(MessageBoxHook hook) {
  MessageBoxState& state = State();
  std::lock_guard lock(state.mutex);
  state.hook = hook ? std::move(hook) : HeadlessMessageBox;
}

int32_t MessageBox(const std::string& text, const std::string& title,
                   uint32_t type) {
  MessageBoxHook hook;
  {
    MessageBoxState& state = State();
    std::lock_guard lock(state.mutex);
    hook = state.hook;
  }
  return hook(text, title, type);
}

}  // namespace platform
