// The library as an in-process server: its three creatable classes,
// kelQLN.API, kelQLN.APIProgress and kelQLN.shared_simplereporter, in one
// module that the library's four entry points forward to. Every object of
// those classes holds a ServerModule::LiveObject of it, so the library says
// truthfully whether it may be unloaded.
#ifndef KELQLN_ENTRY_SERVER_MODULE_H_
#define KELQLN_ENTRY_SERVER_MODULE_H_

#include "automation/server_module.h"

namespace kelqln {

automation::ServerModule& KelQLNModule();

}  // namespace kelqln

#endif  // KELQLN_ENTRY_SERVER_MODULE_H_
