#include "host/dialogs/common_dialog.h"

#include <gtest/gtest.h>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "external/common_dialog.h"

namespace host::dialogs {
namespace {

using automation::CStr;
using automation::Variant;
namespace names = external::common_dialog;

class CommonDialogTest : public ::testing::Test {
 protected:
  void SetUp() override {
    RegisterCommonDialog();
    ResetSaveDialogs();
  }
  void TearDown() override {
    ResetSaveDialogs();
    automation::UnregisterClass(names::kProgId);
  }

  // Shows a save dialog the way a late-bound caller does; its answer.
  static std::string ShowSave(const std::string& initial) {
    automation::Object dialog = automation::CreateObject(names::kProgId);
    automation::LetByName(dialog, names::kDialogTitle, "Save model");
    automation::LetByName(dialog, names::kParentWindow, int32_t{77});
    if (!initial.empty())
      automation::LetByName(dialog, names::kFileName, initial);
    automation::LetByName(dialog, names::kFilter, "Models|*.json");
    automation::CallByName(dialog, names::kShowSave);
    return CStr(automation::GetByName(dialog, names::kFileName));
  }
};

TEST_F(CommonDialogTest, AnswersThePresetsInOrderThenCancels) {
  PresetSaveAnswers({"/tmp/a.json", "  "});
  PresetSaveAnswers({""});
  EXPECT_EQ(ShowSave(""), "/tmp/a.json");
  EXPECT_EQ(ShowSave("old.json"), "  ");
  EXPECT_EQ(ShowSave("old.json"), "");
  // No answer left: cancelled, and the initial name is not handed back.
  EXPECT_EQ(ShowSave("old.json"), "");
  ASSERT_EQ(ShownSaveDialogs().size(), 4u);
  EXPECT_EQ(ShownSaveDialogs()[3].file_name, "old.json");
}

}  // namespace
}  // namespace host::dialogs
