// A minimal in-process server library, loaded by the server tests the way a
// host loads the system's own library.
#include <cstdint>
#include <memory>

#include "automation/member_table.h"
#include "automation/server_module.h"

namespace {

automation::ServerModule& Module();

class Greeter : public automation::DispatchImpl<Greeter> {
 public:
  static const automation::MemberTable<Greeter>& Members() {
    static const automation::MemberTable<Greeter> table(
        "Greeter", {{1, "Greet", automation::CallKind::kMethod,
                     [](Greeter&, automation::Args& args) {
                       return automation::Variant(
                           "Hello, " +
                           automation::CStr(automation::RequiredArg(args, 0)));
                     }}});
    return table;
  }

 private:
  automation::ServerModule::LiveObject live_{Module()};
};

automation::ServerModule& Module() {
  static automation::ServerModule module({
      {"kelTest.Greeter", "{0D7F0001-0000-4000-8000-00000000C0DE}",
       [] { return std::make_shared<Greeter>(); }},
  });
  return module;
}

}  // namespace

extern "C" {
__attribute__((visibility("default"))) int32_t DllRegisterServer() {
  return Module().Register();
}
__attribute__((visibility("default"))) int32_t DllUnregisterServer() {
  return Module().Unregister();
}
__attribute__((visibility("default"))) int32_t DllGetClassObject(
    const char* class_id, const automation::ClassFactory** factory) {
  return Module().GetClassObject(class_id, factory);
}
__attribute__((visibility("default"))) int32_t DllCanUnloadNow() {
  return Module().CanUnloadNow();
}
}
