// The reporter interface as components outside the system reach it: its
// operations by name (late-bound), and the member a cancel target answers.
#ifndef KELQLN_EXTERNAL_REPORTER_API_H_
#define KELQLN_EXTERNAL_REPORTER_API_H_

namespace external::reporter_api {

// In the order of the interface's table of functions.
inline constexpr char kCancel[] = "Cancel";
inline constexpr char kSetCancel[] = "SetCancel";  // (target)
inline constexpr char kTickCount[] = "TickCount";  // (count, with delay)
inline constexpr char kTickText[] = "TickText";    // (text, clear)
inline constexpr char kTick[] = "Tick";            // (name)
inline constexpr char kTask[] = "Task";  // (components, classes, members)
inline constexpr char kClearTask[] = "ClearTask";
inline constexpr char kComponentCount[] = "ComponentCount";      // (count)
inline constexpr char kComponent[] = "Component";                // (name)
inline constexpr char kTotalClassCount[] = "TotalClassCount";    // (count)
inline constexpr char kClassCount[] = "ClassCount";              // (count)
inline constexpr char kClass[] = "Class";                        // (name)
inline constexpr char kTotalMemberCount[] = "TotalMemberCount";  // (count)
inline constexpr char kMemberCount[] = "MemberCount";            // (count)
inline constexpr char kMember[] = "Member";                      // (name)
inline constexpr char kLog[] = "Log";                            // (text)
inline constexpr char kSummary[] = "Summary";                    // (text)
// (text by reference: the reporter may rewrite it)
inline constexpr char kWarning[] = "Warning";
inline constexpr char kError[] = "Error";
inline constexpr char kWarningCount[] = "WarningCount";
inline constexpr char kErrorCount[] = "ErrorCount";
inline constexpr char kClearStatusCounts[] = "ClearStatusCounts";
inline constexpr char kClearStatus[] = "ClearStatus";
inline constexpr char kInformationType[] = "InformationType";  // get and put

// What the object given to SetCancel is told when the run is cancelled.
inline constexpr char kDoCancel[] = "doCancel";

}  // namespace external::reporter_api

#endif  // KELQLN_EXTERNAL_REPORTER_API_H_
