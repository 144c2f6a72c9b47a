// The callback object the program hands to the system's Start: the system
// calls "OnSynchronize"(application, list, reporter) with the elements that
// vanished from the code of one component, and keeps those left in the list
// for deletion; it calls "OnCompleted"(reporter) when the run has finished.
#ifndef KELQLN_HOST_CLI_UPDATE_CALLBACK_H_
#define KELQLN_HOST_CLI_UPDATE_CALLBACK_H_

#include <memory>
#include <vector>

#include "automation/member_table.h"
#include "host/cli/deletion_policy.h"
#include "host/cli/element_summary.h"

namespace host::modeltool {
class Element;
}  // namespace host::modeltool

namespace host::cli {

class UpdateCallback : public automation::DispatchImpl<UpdateCallback> {
 public:
  // `policy` must outlive the callback.
  explicit UpdateCallback(DeletionPolicy& policy) : policy_(policy) {}

  static const automation::MemberTable<UpdateCallback>& Members();

  // Replaces the list (args[1], passed by reference) by a new collection of
  // the elements the policy confirms.
  void OnSynchronize(automation::Args& args);
  void OnCompleted() { completed_ = true; }

  // Whether the run came to its end (a run that fails or stops half-way
  // never calls "OnCompleted").
  bool Completed() const { return completed_; }
  // The confirmed elements that have left the model (a role of an
  // association navigable both ways is only made one-way, and stays).
  std::vector<ElementSummary> Deleted() const;

 private:
  struct Confirmed {
    std::shared_ptr<modeltool::Element> element;
    ElementSummary summary;
  };

  DeletionPolicy& policy_;
  std::vector<Confirmed> confirmed_;
  bool completed_ = false;
};

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_UPDATE_CALLBACK_H_
