// Which of the elements that vanished from the code leave the model: all of
// them, none, or those the user confirms one by one. Asking reads one answer
// a line from `in`: y(es), n(o), a(ll: this one and every later one) or
// N(one: keep this one and every later one); yes, no, all and none may be
// written out in any letter case. The end of the input keeps the element
// asked about and all later ones, so a closed terminal never deletes.
#ifndef KELQLN_HOST_CLI_DELETION_POLICY_H_
#define KELQLN_HOST_CLI_DELETION_POLICY_H_

#include <iosfwd>
#include <string>

#include "host/cli/element_summary.h"

namespace host::cli {

class DeletionPolicy {
 public:
  enum class Mode { kAll, kNone, kAsk };

  // The questions go to `out`; `in` and `out` must outlive the policy.
  DeletionPolicy(Mode mode, std::istream& in, std::ostream& out)
      : mode_(mode), in_(in), out_(out) {}

  // Whether `element` goes.
  bool Confirms(const ElementSummary& element);

 private:
  Mode mode_;
  std::istream& in_;
  std::ostream& out_;
};

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_DELETION_POLICY_H_
