// The process-wide table of creatable classes: what CreateObject finds by
// programmatic identifier ("kelQLN.API") or class identifier ("{...}").
// Both kinds of name match without regard to case.
#ifndef KELQLN_AUTOMATION_CLASS_REGISTRY_H_
#define KELQLN_AUTOMATION_CLASS_REGISTRY_H_

#include <functional>
#include <string>
#include <string_view>

#include "automation/variant.h"

namespace automation {

using Factory = std::function<Object()>;

// Registers (or replaces) a class under both of its names. An empty class
// identifier registers the programmatic identifier only.
void RegisterClass(std::string prog_id, std::string class_id, Factory factory);

// Removes the class registered under that programmatic identifier (and its
// class identifier); false when there was none.
bool UnregisterClass(std::string_view prog_id);

bool IsClassRegistered(std::string_view prog_id_or_class_id);

// A new object of the class; "ActiveX component can't create object" (429)
// when no class has that name. Errors of the factory reach the caller.
Object CreateObject(std::string_view prog_id_or_class_id);

}  // namespace automation

#endif  // KELQLN_AUTOMATION_CLASS_REGISTRY_H_
