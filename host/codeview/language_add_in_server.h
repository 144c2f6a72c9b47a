// The server object of a language add-in, as the modelling tool makes it
// from the add-in's ServerProgId. One server class serves any number of
// add-ins: the tool tells each server its add-in by "OnConnection"(add-in),
// and the server takes the add-in's name (member 12540: the language) and
// registry key (12536: its settings) from it.
//
// Members by name: "OnConnection"(add-in); "GetRTEServer", the round-trip
// server (round_trip_server.h); "CompPropertiesAPI", for the add-in named
// "VC++" only, the component properties (component_properties.h).
#ifndef KELQLN_HOST_CODEVIEW_LANGUAGE_ADD_IN_SERVER_H_
#define KELQLN_HOST_CODEVIEW_LANGUAGE_ADD_IN_SERVER_H_

#include <memory>

#include "automation/member_table.h"
#include "host/codeview/project_reader.h"
#include "host/codeview/round_trip_server.h"

namespace host::codeview {

// The add-in whose servers answer "CompPropertiesAPI".
inline constexpr char kVisualCppAddIn[] = "VC++";

class LanguageAddInServer
    : public automation::DispatchImpl<LanguageAddInServer> {
 public:
  // `reader` reads the code of the add-in's language.
  explicit LanguageAddInServer(std::shared_ptr<const ProjectReader> reader);

  static const automation::MemberTable<LanguageAddInServer>& Members();

  void OnConnection(const automation::Object& add_in);

 private:
  std::shared_ptr<RoundTripServer> round_trip_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_LANGUAGE_ADD_IN_SERVER_H_
