// The add-ins the registry describes (docs/registry.md):
//
//   HKEY_LOCAL_MACHINE\SOFTWARE\Quenta Software\Orel\AddIns
//     "1", "2", ...      text   the installed add-ins' names, in order; the
//                               list ends at the first missing or empty value
//   ...\AddIns\<name>
//     "Active"           dword  0: inactive (missing: active)
//     "LanguageAddIn"    dword  1: a language add-in (missing: not one)
//     "ServerProgId"     text   programmatic identifier of its server object
//     "HelpText"         text   add-in member 12532
//     "RteText"          text   add-in member 12535
//
// The registry has no enumeration of sub-keys, hence the numbered list.
#ifndef KELQLN_HOST_MODELTOOL_ADD_IN_REGISTRY_H_
#define KELQLN_HOST_MODELTOOL_ADD_IN_REGISTRY_H_

#include <string>
#include <vector>

#include "host/modeltool/add_in.h"

namespace host::modeltool {

class AddInManager;

// The descriptions, in the listed order. A registry file that cannot be read
// is the platform's error (automation::kBadFileFormat naming the line).
std::vector<AddInDescription> ReadAddInDescriptions();

// Installs the described add-ins; the one named kSettingsAddInName keeps
// its settings in a SettingsStore at `settings_path`.
void LoadAddInsFromRegistry(
    AddInManager& manager,
    const std::string& settings_path = SettingsStore::DefaultPath());

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_ADD_IN_REGISTRY_H_
