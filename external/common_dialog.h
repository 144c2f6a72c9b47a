// The common save dialog component; all members by name.
#ifndef KELQLN_EXTERNAL_COMMON_DIALOG_H_
#define KELQLN_EXTERNAL_COMMON_DIALOG_H_

namespace external::common_dialog {

inline constexpr char kProgId[] = "keldlg.CommonDialog";
inline constexpr char kDialogTitle[] = "DialogTitle";    // text property
inline constexpr char kParentWindow[] = "ParentWindow";  // window handle
// Text property: the initial name before ShowSave, the chosen one after
// (blank when the user cancelled).
inline constexpr char kFileName[] = "FileName";
inline constexpr char kFilter[] = "Filter";  // "Description|*.ext|..."
inline constexpr char kShowSave[] = "ShowSave";

}  // namespace external::common_dialog

#endif  // KELQLN_EXTERNAL_COMMON_DIALOG_H_
