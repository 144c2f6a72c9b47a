// The four entry points of libkelqln.so, the only symbols it exports.
#include <cstdint>

#include "automation/server_module.h"
#include "entry/server_module.h"

#define KELQLN_EXPORT extern "C" __attribute__((visibility("default")))

KELQLN_EXPORT int32_t DllRegisterServer() {
  return kelqln::KelQLNModule().Register();
}

KELQLN_EXPORT int32_t DllUnregisterServer() {
  return kelqln::KelQLNModule().Unregister();
}

KELQLN_EXPORT int32_t DllGetClassObject(
    const char* class_id, const automation::ClassFactory** factory) {
  return kelqln::KelQLNModule().GetClassObject(class_id, factory);
}

KELQLN_EXPORT int32_t DllCanUnloadNow() {
  return kelqln::KelQLNModule().CanUnloadNow();
}
