// The modelling tool's automation members that the system calls, by object.
// The numbers and names are the tool's; each is listed once here and used by
// the system and by the tool in host/ alike.
#ifndef KELQLN_EXTERNAL_OREL_H_
#define KELQLN_EXTERNAL_OREL_H_

#include "automation/dispatch.h"

namespace external::orel {

using automation::DispId;

// Every collection of the tool: model elements numbered from 1.
namespace collection {
inline constexpr DispId kCount = 202;
inline constexpr DispId kGetAt = 203;        // (index) the element
inline constexpr DispId kIndexOfName = 205;  // (name) its index, 0: none
inline constexpr DispId kFindByName = 212;   // (name) the first, or Nothing
inline constexpr DispId kFindByUniqueId = 213;  // (id) the element or Nothing
}  // namespace collection

namespace application {
inline constexpr DispId kCurrentModel = 209;
inline constexpr DispId kAddInManager = 12544;
inline constexpr DispId kLog = 213;  // (text) a line in the tool's log
// Set to True before the system shows a save dialog.
inline constexpr DispId kSaveDialogPending = 202;
inline constexpr char kGetMainWnd[] = "GetMainWnd";
}  // namespace application

namespace add_in_manager {
inline constexpr DispId kAddIns = 12529;
}  // namespace add_in_manager

namespace add_in {
inline constexpr DispId kName = 12540;
inline constexpr DispId kRegistryKey = 12536;
inline constexpr DispId kServer = 12528;
inline constexpr DispId kHelpText = 12532;
inline constexpr DispId kRteText = 12535;
inline constexpr DispId kIsLanguageAddIn = 12541;
inline constexpr DispId kIsActive = 12553;
// Members of the settings add-in.
inline constexpr char kReadSetting[] = "ReadSetting";    // (section, key, default)
inline constexpr char kWriteSetting[] = "WriteSetting";  // (section, key, value)
inline constexpr char kRootRegistryPath[] = "RootRegistryPath";
}  // namespace add_in

namespace model {
inline constexpr DispId kAllComponents = 434;
inline constexpr DispId kAllClasses = 432;
inline constexpr DispId kSelectedComponents = 430;
inline constexpr DispId kSelectedComponentPackages = 431;
inline constexpr DispId kSelectedClasses = 428;
inline constexpr DispId kSelectedLogicalPackages = 429;
inline constexpr DispId kRootComponentPackage = 418;
inline constexpr DispId kDefaultLanguage = 12680;
inline constexpr DispId kAskForBackup = 12654;
inline constexpr DispId kFilePath = 12441;  // "" when never saved
inline constexpr DispId kSave = 12442;
inline constexpr DispId kSaveAs = 12443;  // (file)
}  // namespace model

// Members every model element has.
namespace element {
inline constexpr DispId kName = 100;
inline constexpr DispId kUniqueId = 102;
inline constexpr DispId kKindName = 12668;
inline constexpr DispId kStereotype = 212;
inline constexpr DispId kApplication = 12523;
inline constexpr char kSetUniqueId[] = "U_SetUniqueID";  // (id)
inline constexpr char kGetContextClass[] = "GetContextClass";
inline constexpr char kParentClass[] = "ParentClass";
// Tool properties.
inline constexpr DispId kFindToolProperty = 121;    // (tool, name)
inline constexpr DispId kToolPropertyValue = 119;   // (tool, name)
inline constexpr DispId kCreateToolProperty = 127;  // (tool, name, value, type)
inline constexpr DispId kOverrideToolProperty = 110;  // (tool, name, value)
inline constexpr DispId kToolProperties = 122;
}  // namespace element

namespace tool_property {
inline constexpr DispId kTool = 205;
inline constexpr DispId kName = 202;
inline constexpr DispId kValue = 203;
inline constexpr DispId kType = 206;
}  // namespace tool_property

// The kind names of element::kKindName.
namespace kind {
inline constexpr char kComponent[] = "Module";
inline constexpr char kClass[] = "Class";
inline constexpr char kAttribute[] = "Attribute";
inline constexpr char kOperation[] = "Operation";
inline constexpr char kRole[] = "Role";
inline constexpr char kInheritRelation[] = "InheritRelation";
inline constexpr char kRealizeRelation[] = "RealizeRelation";
inline constexpr char kHasRelationship[] = "HasRelationship";
}  // namespace kind

namespace component {
inline constexpr DispId kLanguage = 12566;
inline constexpr DispId kClasses = 418;
inline constexpr DispId kModel = 12524;
inline constexpr DispId kComponentPackage = 413;
inline constexpr DispId kDependencies = 421;
inline constexpr DispId kDisplayName = 12555;
}  // namespace component

namespace component_package {
inline constexpr DispId kComponents = 412;
inline constexpr DispId kNewComponent = 416;  // (name)
inline constexpr DispId kIsModifiable = 12438;
}  // namespace component_package

namespace logical_package {
inline constexpr DispId kClasses = 413;
inline constexpr DispId kDeleteClass = 428;  // (class) True when done
inline constexpr DispId kIsModifiable = 12438;
}  // namespace logical_package

namespace class_ {
inline constexpr DispId kComponents = 12491;
inline constexpr DispId kAssignToComponent = 12522;  // (component)
inline constexpr DispId kPackage = 415;
inline constexpr DispId kAddInName = 12642;
inline constexpr DispId kExcludedFromSelection = 12643;
// Deletions of the class's members, each True when done.
inline constexpr DispId kDeleteAttribute = 435;
inline constexpr DispId kDeleteOperation = 434;
inline constexpr DispId kDeleteHasRelationship = 432;
inline constexpr DispId kDeleteInheritRelation = 438;
inline constexpr DispId kDeleteRealizeRelation = 12611;
inline constexpr DispId kDeleteAssociation = 433;
}  // namespace class_

// The owner class of each kind of member.
namespace owner {
inline constexpr DispId kOfAttribute = 434;
inline constexpr DispId kOfOperation = 444;
inline constexpr DispId kOfRole = 621;
inline constexpr DispId kOfInheritRelation = 12600;
inline constexpr DispId kOfHasRelationship = 12600;
inline constexpr DispId kOfRealizeRelation = 12602;
}  // namespace owner

namespace role {
inline constexpr DispId kAssociation = 620;
inline constexpr char kAssociationName[] = "Association";
inline constexpr char kNavigable[] = "Navigable";
inline constexpr char kClass[] = "Class";
}  // namespace role

namespace association {
inline constexpr DispId kRole1 = 413;
inline constexpr DispId kRole2 = 414;
inline constexpr char kRole1Name[] = "Role1";
inline constexpr char kRole2Name[] = "Role2";
inline constexpr char kNameName[] = "Name";
}  // namespace association

namespace dependency {
inline constexpr DispId kIsComponentDependency = 12607;
inline constexpr DispId kSupplier = 12609;
inline constexpr DispId kStereotype = 212;
}  // namespace dependency

}  // namespace external::orel

#endif  // KELQLN_EXTERNAL_OREL_H_
