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
}

TEST_F(CommonDialogTest, RecordsWhatEachDialogShowed) {
  ShowSave("");
  ShowSave("start.json");
  auto shown = ShownSaveDialogs();
  ASSERT_EQ(shown.size(), 2u);
  EXPECT_EQ(shown[0].title, "Save model");
  EXPECT_EQ(automation::CLng(shown[0].parent_window), 77);
  EXPECT_EQ(shown[0].file_name, "");
  EXPECT_EQ(shown[0].filter, "Models|*.json");
  EXPECT_EQ(shown[1].file_name, "start.json");

  ResetSaveDialogs();
  EXPECT_TRUE(ShownSaveDialogs().empty());
}

}  // namespace
}  // namespace host::dialogs
