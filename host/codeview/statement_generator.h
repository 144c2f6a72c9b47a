// The statement generator of a language add-in. Its inclusion query
// (member 1: element, item, mode, reporter, result by reference) answers
// whether the add-in takes the element: False when the element or the item
// carries a stereotype of the add-in's "RefusedStereotypes" (compared
// without regard to case), True otherwise. The answer is also written into
// `result`, and a refusal is said on the reporter as a log line.
#ifndef KELQLN_HOST_CODEVIEW_STATEMENT_GENERATOR_H_
#define KELQLN_HOST_CODEVIEW_STATEMENT_GENERATOR_H_

#include <memory>

#include "automation/member_table.h"
#include "host/codeview/add_in_settings.h"
#include "host/codeview/reporter_link.h"

namespace host::codeview {

class StatementGenerator : public automation::DispatchImpl<StatementGenerator> {
 public:
  explicit StatementGenerator(std::shared_ptr<const AddInSettings> settings);

  static const automation::MemberTable<StatementGenerator>& Members();

  bool Includes(const automation::Variant& element,
                const automation::Variant& item,
                const ReporterLink& reporter) const;

 private:
  std::shared_ptr<const AddInSettings> settings_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_STATEMENT_GENERATOR_H_
