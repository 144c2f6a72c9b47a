// What a language add-in reads from a project's code, whatever the language
// or the reader: the project's components (units of code such as source
// files or modules), the classes each one holds and their members. The
// framework maps this onto the modelling tool's model; readers only fill it.
#ifndef KELQLN_HOST_CODEVIEW_CODE_MODEL_H_
#define KELQLN_HOST_CODEVIEW_CODE_MODEL_H_

#include <string>
#include <vector>

namespace host::codeview {

// Visibility of attributes and operations, as the model keeps it.
inline constexpr char kPublic[] = "public";

struct CodeParameter {
  std::string name;
  std::string type;
};

struct CodeAttribute {
  std::string name;
  std::string type;
  std::string visibility = kPublic;
  std::string initial_value;
};

struct CodeOperation {
  std::string name;
  std::string return_type;
  std::string visibility = kPublic;
  std::vector<CodeParameter> parameters;
};

// A member whose type is another class, held by value.
struct CodeHas {
  std::string name;
  std::string class_name;
};

// One navigable end of an association: the class that declares it points
// at `class_name` through the member `name`.
struct CodeRole {
  std::string name;
  std::string class_name;
  // Names the association; the other class's role with the same
  // association name becomes the other end of the same association.
  std::string association;
  std::string cardinality;
  bool aggregate = false;
};

struct CodeClass {
  std::string name;
  // The model element the code was made from, when the code records it.
  std::string unique_id;
  std::string stereotype;
  std::vector<CodeAttribute> attributes;
  std::vector<CodeOperation> operations;
  std::vector<std::string> bases;
  std::vector<std::string> realizes;
  std::vector<CodeHas> has;
  std::vector<CodeRole> roles;
};

struct CodeComponent {
  std::string name;
  std::vector<CodeClass> classes;
};

struct CodeProject {
  std::string name;
  // The model component the code belongs to, when the code records it.
  std::string unique_id;
  std::vector<CodeComponent> components;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_CODE_MODEL_H_
