// Finding the modelling tool's add-ins, deciding whether one takes part in a
// tool's work, reaching its server and round-trip server, and reading the
// few settings that live in the registry (always under HKEY_LOCAL_MACHINE;
// nothing here writes it).
//
// Failures come back as Nothing, an empty collection or False, and no
// message is shown, with one exception: GetAddInServer with a tag for an
// add-in that does not exist raises "Object variable not set" (91), since
// there is no add-in to ask whether it takes part.
#ifndef KELQLN_ENTRY_ADD_IN_SERVICES_H_
#define KELQLN_ENTRY_ADD_IN_SERVICES_H_

#include <memory>
#include <string_view>

#include "automation/collection.h"
#include "automation/variant.h"
#include "platform/registry.h"

namespace kelqln {

// The tag of this tool in the add-ins' "Enable<tag>" values.
inline constexpr char kQuillonTag[] = "QLN";
// The add-in that holds the wizard's settings and the tool-wide ones, and
// its key below HKEY_LOCAL_MACHINE, where the tool-wide settings are read.
inline constexpr char kVSAddInName[] = "VisualStudio";
inline constexpr char kVSAddInKey[] =
    "SOFTWARE\\Quenta Software\\Orel\\AddIns\\VisualStudio";

// The text of a string value, the number (Long) of a 32-bit number value, or
// Empty when the key or value is missing or of any other type.
automation::Variant ReadRegistryValue(platform::HKEY root, std::string_view key,
                                      std::string_view value_name);

// The add-in named exactly `name` (letter case counts), or Nothing.
automation::Object FindAddIn(const automation::Object& application,
                             std::string_view name);

// FindAddIn(application, "VisualStudio").
automation::Object GetVSAddIn(const automation::Object& application);

// The server object of the add-in `add_in_name`, or Nothing when it has no
// readable server or, for a non-empty `tag`, does not take part in that tool.
automation::Object GetAddInServer(const automation::Object& application,
                                  std::string_view add_in_name,
                                  std::string_view tag);

// The round-trip server of `server` ("GetRTEServer"), or `server` itself when
// it has none to give.
automation::Object GetRTEServerOf(const automation::Object& server);

// False only when the add-in's "Enable<tag>" value is exactly "No". A Nothing
// add-in raises 91.
bool IsAddInEnabled(const automation::Object& add_in, std::string_view tag);

// Whether the add-in is an active round-trip language add-in (and, for a
// non-empty `tag`, takes part in that tool).
bool IsRTEAddIn(const automation::Object& application,
                std::string_view add_in_name, std::string_view tag);

// The servers of the add-ins listed under the add-in's "\AddIns" key (values
// "1", "2", ... up to the first missing or empty one), keyed by add-in name.
// A listed add-in without a server, or listed twice, is left out.
std::shared_ptr<automation::Collection> GetAddInServers(
    const automation::Object& application, std::string_view add_in_name,
    std::string_view tag);

// The class stereotypes listed, separated by ";", in the "VisualStudio"
// add-in's "ExcludeClassStereotypes" value, each trimmed and keyed by itself.
// Empty pieces are skipped and a name given again (in any letter case) is
// kept once.
std::shared_ptr<automation::Collection> GetExcludedClassStereotypes(
    const automation::Object& application);

}  // namespace kelqln

#endif  // KELQLN_ENTRY_ADD_IN_SERVICES_H_
