#include "host/codeview/language_add_in_server.h"

#include <string>
#include <utility>

#include "automation/call.h"
#include "automation/error.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "host/codeview/component_properties.h"

namespace host::codeview {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace server = external::code_view::add_in_server;

LanguageAddInServer::LanguageAddInServer(
    std::shared_ptr<const ProjectReader> reader)
    : round_trip_(std::make_shared<RoundTripServer>(std::move(reader))) {}

void LanguageAddInServer::OnConnection(const automation::Object& add_in) {
  if (!add_in) throw automation::Error(automation::kObjectNotSet);
  // The add-in is not kept: it keeps this server, and the two values are
  // all the server needs of it.
  std::string name =
      automation::CStr(automation::Get(add_in, external::orel::add_in::kName));
  std::string key = automation::CStr(
      automation::Get(add_in, external::orel::add_in::kRegistryKey));
  if (name.empty()) {
    throw automation::Error(automation::kInvalidProcedureCall,
                            "A language add-in has a name: its language's");
  }
  round_trip_->Connect(std::move(name), std::move(key));
}

const automation::MemberTable<LanguageAddInServer>&
LanguageAddInServer::Members() {
  static const automation::MemberTable<LanguageAddInServer> table(
      "LanguageAddInServer",
      {
          {automation::kNamedOnly, server::kOnConnection, CallKind::kMethod,
           [](LanguageAddInServer& self, Args& args) {
             self.OnConnection(
                 automation::CObj(automation::RequiredArg(args, 0)));
             return Variant();
           }},
          {automation::kNamedOnly, server::kGetRteServer, CallKind::kMethod,
           [](LanguageAddInServer& self, Args&) {
             return Variant(self.round_trip_);
           }},
          {automation::kNamedOnly, server::kCompPropertiesApi,
           CallKind::kPropertyGet,
           [](LanguageAddInServer& self, Args&) {
             const std::string& name = self.round_trip_->Settings().Name();
             if (name != kVisualCppAddIn) {
               throw automation::Error(automation::kNoSuchMember,
                                       "Only the " +
                                           std::string(kVisualCppAddIn) +
                                           " add-in answers CompPropertiesAPI");
             }
             return Variant(std::make_shared<ComponentProperties>(name));
           }},
      });
  return table;
}

}  // namespace host::codeview
