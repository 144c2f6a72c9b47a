// One update run: the model components of the selected code-view projects
// are brought up to date with their code, language by language and project
// by project, and what vanished from the code is removed from the model once
// the user (on the wizard's synchronize page) or the caller's callback
// object ("OnSynchronize") has confirmed it. The code-view services write
// the model; the engine drives the order, the progress and result lines,
// cancellation, the optional backup, the language add-ins' notices and the
// deletions.
//
// Failures of the modelling tool, the code-view services or the selection
// that the steps below do not name end the run and reach the caller; the
// steps after the failing one are not done.
#ifndef KELQLN_ENGINE_KEL_MODEL_UPDATE_ENGINE_H_
#define KELQLN_ENGINE_KEL_MODEL_UPDATE_ENGINE_H_

#include <cstdint>
#include <memory>
#include <string>

#include "automation/collection.h"
#include "automation/variant.h"
#include "reporting/kel_reporter_api.h"
#include "selection/selection_collections.h"

namespace kelqln {

class APIProgress;
class kelSortedComponents;
class kelSortedCVProject;
class kelSortedCVProjects;

class kelModelUpdateEngine {
 public:
  // Used when the registry sets no "ProjectPause".
  static constexpr float kDefaultProjectPauseSeconds = 1.0f;

  // Both write a line to the debug log.
  kelModelUpdateEngine();
  ~kelModelUpdateEngine();
  kelModelUpdateEngine(const kelModelUpdateEngine&) = delete;
  kelModelUpdateEngine& operator=(const kelModelUpdateEngine&) = delete;

  // The closing lines (texts 1647, 1648 and the totals 1621) on the log and
  // the summary, the status display switched to show them (when the
  // reporter is an APIProgress: one a callback put in its place may have no
  // displays), and, unless `fSilent`, the wizard's summary page.
  void ShowSummaryPage(bool fSilent);

  // Shows the candidates on the wizard's synchronize page and waits, letting
  // the message loop run, until the user confirms; returns the user's choice.
  std::shared_ptr<kelSortedComponents> ShowSynchronizePage(
      const std::shared_ptr<kelSortedComponents>& candidates);

  // The servers of the active round-trip add-ins, keyed by add-in name (the
  // name of its language). An add-in that fails any step is left out.
  std::shared_ptr<automation::Collection> GetAddInEventServers(
      const automation::Object& theOrelApp);

  // The run. `progress` becomes the reporter; `CallBack` (may be Nothing)
  // confirms the deletions and, in a silent run, hears "OnCompleted". Every
  // project processed leaves `codeSelection`.
  void UpdateModel(const automation::Object& theOrelApp,
                   const std::shared_ptr<kelSortedCVProjects>& codeSelection,
                   std::shared_ptr<APIProgress>& progress,
                   const automation::Object& CallBack, bool fSilent);

  // Asks the run to stop at its next cancel check.
  void RequestCancel();

  // Lets the message loop run once; when the run has been cancelled, reports
  // text 3611 as an error and a summary line and shows the summary.
  bool IsCancelled();

  void ShowCancelledSummary();

  // Returns after `seconds` of elapsed time, without letting the message loop
  // run; a wait across midnight is no different.
  void Pause(float seconds);

  // Tells the language's round-trip server, then the servers of the add-ins
  // registered under the language add-in, that an update of the language
  // starts ("OnModelUpdateStart") or ends ("OnModelUpdateEnd"). Failures are
  // ignored.
  void NotifyModelUpdate(const std::string& language,
                         const automation::Object& server, bool starting);

  // Has the callback confirm the elements of `selection`: they go to its
  // "OnSynchronize" as one list, and the list it hands back, with elements
  // filed under `component` (members under their owner class), becomes the
  // selection. Without callback the selection stays. A callback without
  // "OnSynchronize" leaves the selection as it is, so every candidate goes;
  // one that fails, or hands back no list or no reporter, gets an empty
  // selection and the reporter an error line (text 3660) naming the error:
  // a callback that breaks half-way must not cost the user the model
  // elements it never confirmed.
  void SynchronizeWithCallBack(const automation::Object& CallBack,
                               std::shared_ptr<kelSortedComponents>& selection,
                               const automation::Object& component);

  // Files `member` under the entry of `owner` in `component`, making the
  // entry when there is none.
  void AddToSelection(const automation::Object& member,
                      const automation::Object& owner,
                      const automation::Object& component,
                      kelSortedComponents& selection);

 private:
  struct Run;

  void Backup(const Run& run, const automation::Collection& servers,
              const NameCollection& languages);
  // One project of `language`; false when the run was cancelled in it.
  bool UpdateProject(Run& run, const std::string& language,
                     const automation::Object& server,
                     const std::shared_ptr<kelSortedCVProject>& project);
  // Updates the model from the code-view components of the project; false
  // when the run was cancelled in it.
  bool UpdateComponents(const Run& run, const automation::Object& cv,
                        const kelSortedCVProject& project,
                        const automation::Object& collector);
  void SynchronizeProject(const Run& run, const std::string& language,
                          const automation::Object& component,
                          const automation::Object& collector);
  void ReportProjectResult(Run& run, const std::string& component_name);
  void RemoveProject(const Run& run, const kelSortedCVProject& project,
                     const automation::Object& component);

  bool cancelled_ = false;
  std::shared_ptr<kelReporterApi> reporter_;
};

}  // namespace kelqln

#endif  // KELQLN_ENGINE_KEL_MODEL_UPDATE_ENGINE_H_
