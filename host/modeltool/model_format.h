// The names of a model file's fields, shared by its reader and its writer
// (docs/model-format.md describes the format).
#ifndef KELQLN_HOST_MODELTOOL_MODEL_FORMAT_H_
#define KELQLN_HOST_MODELTOOL_MODEL_FORMAT_H_

namespace host::modeltool::model_format {

inline constexpr char kFormatName[] = "kelqln-model";
inline constexpr int kVersion = 1;

inline constexpr char kFormat[] = "format";
inline constexpr char kVersionField[] = "version";
inline constexpr char kDefaultLanguage[] = "defaultLanguage";
inline constexpr char kAskForBackup[] = "askForBackup";
inline constexpr char kComponentView[] = "componentView";
inline constexpr char kLogicalView[] = "logicalView";
inline constexpr char kAssociations[] = "associations";
inline constexpr char kSelection[] = "selection";
inline constexpr char kComponentPackages[] = "componentPackages";
inline constexpr char kLogicalPackages[] = "logicalPackages";

// Every element.
inline constexpr char kId[] = "id";
inline constexpr char kName[] = "name";
inline constexpr char kStereotype[] = "stereotype";
inline constexpr char kToolProperties[] = "toolProperties";
inline constexpr char kTool[] = "tool";
inline constexpr char kValue[] = "value";
inline constexpr char kType[] = "type";

inline constexpr char kModifiable[] = "modifiable";
inline constexpr char kPackages[] = "packages";
inline constexpr char kComponents[] = "components";
inline constexpr char kClasses[] = "classes";
inline constexpr char kLanguage[] = "language";
inline constexpr char kDependencies[] = "dependencies";
inline constexpr char kSupplier[] = "supplier";
inline constexpr char kSupplierName[] = "supplierName";
inline constexpr char kAddInName[] = "addInName";
inline constexpr char kExcludedFromSelection[] = "excludedFromSelection";
inline constexpr char kAttributes[] = "attributes";
inline constexpr char kInitialValue[] = "initialValue";
inline constexpr char kOperations[] = "operations";
inline constexpr char kReturnType[] = "returnType";
inline constexpr char kParameters[] = "parameters";
inline constexpr char kDefaultValue[] = "defaultValue";
inline constexpr char kHasRelationships[] = "hasRelationships";
inline constexpr char kInheritRelations[] = "inheritRelations";
inline constexpr char kRealizeRelations[] = "realizeRelations";
inline constexpr char kRoles[] = "roles";
inline constexpr char kClass[] = "class";
inline constexpr char kNavigable[] = "navigable";
inline constexpr char kCardinality[] = "cardinality";
inline constexpr char kAggregate[] = "aggregate";

}  // namespace host::modeltool::model_format

#endif  // KELQLN_HOST_MODELTOOL_MODEL_FORMAT_H_
