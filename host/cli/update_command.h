// `kelqln update`: brings a model file up to date with the code of its
// components through the add-in library, as the modelling tool would:
// creates kelQLN.API, calls its Start late-bound with the selection and a
// callback object that applies the deletion policy, prints the tool's log
// as the run writes it, then the reporter's summary lines, warnings and
// errors, and saves the model (atomically) once the run has finished.
//
// Whether the run changed the model is told by the model's text before and
// after the run (the file format's own writer, which writes a model the
// same way every time); an unchanged model is not written at all.
#ifndef KELQLN_HOST_CLI_UPDATE_COMMAND_H_
#define KELQLN_HOST_CLI_UPDATE_COMMAND_H_

#include <iosfwd>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "automation/variant.h"
#include "host/cli/deletion_policy.h"

namespace host::modeltool {
class Model;
}  // namespace host::modeltool

namespace host::cli {

struct RunReport;
class UpdateCallback;

struct UpdateOptions {
  std::string model;
  std::vector<std::string> selects;
  DeletionPolicy::Mode deletion = DeletionPolicy::Mode::kAll;
  // Run in memory only: nothing is written, not even a save the run asks
  // for.
  bool dry_run = false;
  // A dry run whose exit code says whether the model is in sync.
  bool check = false;
  std::string report;
  // Leaves out the tool's log and the summary lines.
  bool quiet = false;
  std::string registry;
};

class UpdateCommand {
 public:
  // The questions of --delete ask read `in` and go to `err`, with the
  // program's own messages; the run's lines go to `out`.
  UpdateCommand(UpdateOptions options, std::istream& in, std::ostream& out,
                std::ostream& err)
      : options_(std::move(options)), in_(in), out_(out), err_(err) {}

  // The exit code (exit_code.h). UsageError or automation::Error when an
  // input cannot be used; nothing has run or been written then.
  int Run();

 private:
  // Runs the system's Start; why the run failed, or "" when it came to its
  // end (errors it reported included).
  std::string StartRun(const automation::Object& app,
                       const automation::Object& selection,
                       const std::shared_ptr<UpdateCallback>& callback,
                       RunReport& report);
  // Saves a changed model unless the run is a trial, and says what became
  // of the file; the exit code.
  int Conclude(modeltool::Model& model, bool changed, int code,
               RunReport& report);
  void PrintLines(const std::vector<std::string>& lines);
  // The four collections of the reporter the run handed back.
  static void ReadReporter(const automation::Object& reporter,
                           RunReport& report);

  UpdateOptions options_;
  std::istream& in_;
  std::ostream& out_;
  std::ostream& err_;
};

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_UPDATE_COMMAND_H_
