// `kelqln new`: a model file with one component bound to its code project,
// ready for `kelqln update`.
#ifndef KELQLN_HOST_CLI_NEW_MODEL_COMMAND_H_
#define KELQLN_HOST_CLI_NEW_MODEL_COMMAND_H_

#include <iosfwd>
#include <string>

namespace host::cli {

struct NewModelOptions {
  std::string model;
  std::string component;
  std::string language;
  // As the user names it (from the current directory); the model keeps it
  // relative to the model file's directory, where the language add-in
  // looks for it, unless it is absolute.
  std::string project;
  std::string registry;
};

// Writes the model; the exit code. UsageError when the file exists already
// or no language add-in of that name is installed.
int RunNewModel(const NewModelOptions& options, std::ostream& out);

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_NEW_MODEL_COMMAND_H_
