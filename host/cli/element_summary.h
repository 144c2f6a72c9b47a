// What a person needs to recognise a model element that is about to go: its
// kind, the element it belongs to and its name. Taken while the element is
// still in the model, so it stays readable after the deletion.
#ifndef KELQLN_HOST_CLI_ELEMENT_SUMMARY_H_
#define KELQLN_HOST_CLI_ELEMENT_SUMMARY_H_

#include <string>

namespace host::modeltool {
class Element;
}  // namespace host::modeltool

namespace host::cli {

struct ElementSummary {
  // The tool's kind name: "Class", "Attribute", "Operation", "Role"...
  std::string kind;
  // A class's component (its first), a member's class.
  std::string owner;
  // The element's name; for an unnamed relation or role, the class it
  // points at.
  std::string name;
  std::string unique_id;

  static ElementSummary Of(const modeltool::Element& element);
};

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_ELEMENT_SUMMARY_H_
