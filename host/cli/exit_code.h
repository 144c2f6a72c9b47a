// The program's exit codes, which scripts and CI jobs rely on.
#ifndef KELQLN_HOST_CLI_EXIT_CODE_H_
#define KELQLN_HOST_CLI_EXIT_CODE_H_

namespace host::cli {

enum ExitCode : int {
  kDone = 0,
  // The run reported errors, failed, or its result could not be saved.
  kRunErrors = 1,
  // Bad usage, or a model, registry or library file that cannot be used:
  // nothing was run and no file was written.
  kBadInput = 2,
  // --check: the update would change the model.
  kDrift = 3,
};

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_EXIT_CODE_H_
