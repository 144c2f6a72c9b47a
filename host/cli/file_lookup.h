// Where the program finds what it needs besides the model: the registry file
// (the add-ins and the system's settings) and the add-in library.
#ifndef KELQLN_HOST_CLI_FILE_LOOKUP_H_
#define KELQLN_HOST_CLI_FILE_LOOKUP_H_

#include <string>

namespace host::cli {

// The registry file: `option` (--registry) when given, else
// $KELQLN_REGISTRY, else the user's file ($XDG_CONFIG_HOME/kelqln or
// ~/.config/kelqln, registry.reg) when it exists, else the default file of
// an installation (../share/kelqln/registry.reg from the program) or of the
// source tree the program was built from (data/registry.reg). A file named
// by the option or the variable must exist: a typing error would otherwise
// pass for an empty registry and the run would quietly do nothing.
// UsageError when no file is found.
std::string FindRegistryFile(const std::string& option);

// The add-in library: $KELQLN_LIBRARY, else libkelqln.so beside the program,
// else ../lib/libkelqln.so from it. UsageError, naming the places tried,
// when there is none.
std::string FindAddInLibrary();

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_FILE_LOOKUP_H_
