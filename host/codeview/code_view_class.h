// A class of a code-view project's code, as the element index hands it out.
// It answers like a code-view component (Project 1, Name 2, UpdateModel 7),
// so a selection of single classes can be updated class by class, and also
// UniqueID 4 (the id of its model class once matched, else the id the code
// records) and "Component" (the code-view component holding it).
#ifndef KELQLN_HOST_CODEVIEW_CODE_VIEW_CLASS_H_
#define KELQLN_HOST_CODEVIEW_CODE_VIEW_CLASS_H_

#include <memory>
#include <string>

#include "automation/member_table.h"

namespace host::codeview {

class CodeViewProject;

class CodeViewClass : public automation::DispatchImpl<CodeViewClass> {
 public:
  CodeViewClass(std::shared_ptr<CodeViewProject> project, std::string name);

  static const automation::MemberTable<CodeViewClass>& Members();

 private:
  std::string UniqueId() const;
  automation::Object Component() const;

  std::shared_ptr<CodeViewProject> project_;
  std::string name_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_CODE_VIEW_CLASS_H_
