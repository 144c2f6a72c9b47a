// kelReporterApi across late-bound calls: the rows that let a reporter class
// answer the interface's operations by name, and the conversions between a
// reporter and the object that stands for it in an argument list.
#ifndef KELQLN_REPORTING_REPORTER_API_DISPATCH_H_
#define KELQLN_REPORTING_REPORTER_API_DISPATCH_H_

#include <memory>
#include <vector>

#include "automation/member_table.h"
#include "reporting/kel_reporter_api.h"

namespace kelqln {

using ReporterApiRow = automation::MemberTable<kelReporterApi>::Row;

// The interface's operations, reached by name only.
const std::vector<ReporterApiRow>& ReporterApiRows();

// `own` followed by the interface's operations, for the member table of a
// class T that implements kelReporterApi. A name T already has keeps its
// number and takes the interface's handler.
template <class T>
std::vector<typename automation::MemberTable<T>::Row> WithReporterApiRows(
    std::vector<typename automation::MemberTable<T>::Row> own) {
  for (const ReporterApiRow& row : ReporterApiRows()) {
    own.push_back({row.id, row.name, row.kind,
                   [handler = row.handler](T& self, automation::Args& args) {
                     return handler(self, args);
                   }});
  }
  return own;
}

// The object to pass for `reporter` in a late-bound call: Nothing for none;
// a reporter without a late-bound face is a type mismatch (13).
automation::Object ReporterObject(
    const std::shared_ptr<kelReporterApi>& reporter);

// The reporter an argument holds after a call: Nothing gives none; an object
// that is no reporter is a type mismatch (13).
std::shared_ptr<kelReporterApi> ReporterOf(const automation::Variant& value);

}  // namespace kelqln

#endif  // KELQLN_REPORTING_REPORTER_API_DISPATCH_H_
