// The language add-ins' servers and the code-view objects they hand out: the
// members the system calls on them.
#ifndef KELQLN_EXTERNAL_CODE_VIEW_H_
#define KELQLN_EXTERNAL_CODE_VIEW_H_

#include "automation/dispatch.h"

namespace external::code_view {

using automation::DispId;

// The server object of a language add-in.
namespace add_in_server {
// Called by the modelling tool with the add-in object once it has made the
// server, so that one server class can serve several add-ins.
inline constexpr char kOnConnection[] = "OnConnection";  // (add-in)
inline constexpr char kGetRteServer[] = "GetRTEServer";
inline constexpr char kCompPropertiesApi[] = "CompPropertiesAPI";
}  // namespace add_in_server

// What "CompPropertiesAPI" gives.
namespace comp_properties {
inline constexpr char kProjectFile[] = "ProjectFile";  // (component)
}  // namespace comp_properties

// The round-trip server of a language add-in; all members by name.
namespace rte_server {
inline constexpr char kCodeViewProject[] = "CodeViewProject";  // (component, reporter)
inline constexpr char kStatementGenerator[] = "StatementGenerator";
inline constexpr char kLanguageInfo[] = "LanguageInfo";
inline constexpr char kCodeIcons[] = "CodeIcons";
inline constexpr char kShouldBackupModel[] = "ShouldBackupModel";
inline constexpr char kOnModelUpdateStart[] = "OnModelUpdateStart";
inline constexpr char kOnModelUpdateEnd[] = "OnModelUpdateEnd";
inline constexpr char kGetComponentFromProject[] = "GetComponentFromProject";
inline constexpr char kComponentInfo[] = "ComponentInfo";
inline constexpr char kOnNewComponent[] = "OnNewComponent";
inline constexpr char kOnProperties[] = "OnProperties";
inline constexpr char kGetContextClass[] = "GetContextClass";
}  // namespace rte_server

// The statement generator. Its first operation, the inclusion query, takes
// (element, item, mode, reporter, result): it answers True to include the
// element and writes the same answer into `result` (by reference).
namespace statement_generator {
inline constexpr DispId kProcess = 1;
inline constexpr char kProcessName[] = "Process";
}  // namespace statement_generator

namespace project {
inline constexpr DispId kLanguage = 1;  // the first property
inline constexpr DispId kName = 2;
inline constexpr DispId kComponents = 3;
inline constexpr DispId kUniqueId = 4;  // get and put
inline constexpr DispId kElementIndex = 5;
inline constexpr DispId kOpen = 6;         // (reporter), raises on failure
inline constexpr DispId kUpdateModel = 7;  // (model, reporter, collector, False)
inline constexpr DispId kFinish = 8;       // (reporter)
inline constexpr DispId kRelease = 9;      // (reporter)
}  // namespace project

namespace component {
inline constexpr DispId kProject = 1;
inline constexpr DispId kName = 2;
inline constexpr DispId kUpdateModel = 7;  // (model, reporter, collector, True)
}  // namespace component

namespace element_index {
inline constexpr DispId kFind = 1;  // (name, unique id) the element or Nothing
}  // namespace element_index

namespace workspace {
inline constexpr DispId kProjects = 1;
}  // namespace workspace

// What vanished from the code during one project's update.
namespace collector {
inline constexpr char kProgId[] = "kelcv.VanishedElementCollector";
inline constexpr DispId kVanishedClasses = 1;  // collection of model classes
inline constexpr DispId kVanishedMembers = 2;  // collection of entries
}  // namespace collector

namespace collector_entry {
inline constexpr DispId kClass = 1;    // the owner model class
inline constexpr DispId kMembers = 2;  // collection of model elements
}  // namespace collector_entry

}  // namespace external::code_view

#endif  // KELQLN_EXTERNAL_CODE_VIEW_H_
