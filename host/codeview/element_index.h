// The element index of a code-view project: member Find 1 (name, unique id)
// gives the code-view element, or Nothing.
//
// A class whose unique id (its model class's id once matched, else the id
// its code records) equals the id given is found first; then the class of
// that name; then the code-view component of that name. Names and ids
// compare exactly.
#ifndef KELQLN_HOST_CODEVIEW_ELEMENT_INDEX_H_
#define KELQLN_HOST_CODEVIEW_ELEMENT_INDEX_H_

#include <memory>
#include <string>

#include "automation/member_table.h"

namespace host::codeview {

class CodeViewProject;

class ElementIndex : public automation::DispatchImpl<ElementIndex> {
 public:
  explicit ElementIndex(std::shared_ptr<CodeViewProject> project);

  static const automation::MemberTable<ElementIndex>& Members();

  automation::Object Find(const std::string& name,
                          const std::string& unique_id) const;

 private:
  std::shared_ptr<CodeViewProject> project_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_ELEMENT_INDEX_H_
