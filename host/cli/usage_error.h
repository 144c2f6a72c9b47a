// A command that cannot be carried out as asked: a bad option value, a file
// that is missing or cannot be used. Nothing has been run or written when it
// is raised; the program prints its message and exits with kBadInput.
#ifndef KELQLN_HOST_CLI_USAGE_ERROR_H_
#define KELQLN_HOST_CLI_USAGE_ERROR_H_

#include <stdexcept>

namespace host::cli {

class UsageError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_USAGE_ERROR_H_
