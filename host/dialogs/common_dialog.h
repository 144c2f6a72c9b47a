// The common save dialog component "keldlg.CommonDialog". A headless process
// has no window to show it in, so the host states beforehand what the user
// will answer; every dialog shown is recorded so a test can check what the
// user would have seen.
#ifndef KELQLN_HOST_DIALOGS_COMMON_DIALOG_H_
#define KELQLN_HOST_DIALOGS_COMMON_DIALOG_H_

#include <string>
#include <vector>

#include "automation/member_table.h"

namespace host::dialogs {

// What one save dialog showed.
struct SaveDialogShown {
  std::string title;
  automation::Variant parent_window;  // Empty when none was given
  std::string file_name;              // the initial name
  std::string filter;
};

class CommonDialog : public automation::DispatchImpl<CommonDialog> {
 public:
  static const automation::MemberTable<CommonDialog>& Members();

  // Takes the next preset answer as the chosen file name. With no answer
  // left the user cancels, which leaves FileName empty, so that a caller
  // never mistakes the initial name for a choice.
  void ShowSave();

 private:
  std::string dialog_title_;
  automation::Variant parent_window_;
  std::string file_name_;
  std::string filter_;
};

// Makes "keldlg.CommonDialog" creatable.
void RegisterCommonDialog();

// Appends the answers of the next save dialogs, in the order they will be
// shown: the file name the user types, which may be empty or blank.
void PresetSaveAnswers(std::vector<std::string> answers);

// The save dialogs shown so far, oldest first.
std::vector<SaveDialogShown> ShownSaveDialogs();

// Forgets the answers not yet given and the dialogs shown.
void ResetSaveDialogs();

}  // namespace host::dialogs

#endif  // KELQLN_HOST_DIALOGS_COMMON_DIALOG_H_
