#include "host/modeltool/add_in.h"

#include <utility>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/error.h"
#include "external/code_view.h"
#include "external/orel.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::RequiredArg;
using automation::Variant;
namespace orel = external::orel;

AddIn::AddIn(AddInDescription description)
    : description_(std::move(description)) {}

std::string AddIn::RegistryKey() const {
  if (!description_.registry_key.empty()) return description_.registry_key;
  return std::string(kAddInsKey) + "\\" + description_.name;
}

automation::Object AddIn::Server() {
  if (server_) return server_;
  if (description_.server_prog_id.empty()) {
    throw automation::Error(
        automation::kCannotCreateObject,
        "The add-in " + description_.name + " has no server object");
  }
  automation::Object server =
      automation::CreateObject(description_.server_prog_id);
  // A server class may serve several add-ins: it learns which one from the
  // add-in object. A server that fails to connect is not kept.
  if (Answers(server, external::code_view::add_in_server::kOnConnection)) {
    automation::CallByName(server,
                           external::code_view::add_in_server::kOnConnection,
                           automation::Object(shared_from_this()));
  }
  server_ = std::move(server);
  return server_;
}

bool AddIn::Answers(const automation::Object& object, std::string_view name) {
  if (!object) return false;
  try {
    object->IdOfName(name);
    return true;
  } catch (const automation::Error& error) {
    if (error.Number() != automation::kNoSuchMember) throw;
    return false;
  }
}

const SettingsStore& AddIn::RequireSettings() const {
  if (!settings_) throw automation::Error(automation::kNoSuchMember);
  return *settings_;
}

const automation::MemberTable<AddIn>& AddIn::Members() {
  static const automation::MemberTable<AddIn> table(
      "AddIn",
      {
          {orel::add_in::kName, "Name", CallKind::kPropertyGet,
           [](AddIn& self, Args&) { return Variant(self.description_.name); }},
          {orel::add_in::kRegistryKey, "RegistryKey", CallKind::kPropertyGet,
           [](AddIn& self, Args&) { return Variant(self.RegistryKey()); }},
          {orel::add_in::kServer, "Server", CallKind::kPropertyGet,
           [](AddIn& self, Args&) { return Variant(self.Server()); }},
          {orel::add_in::kHelpText, "HelpText", CallKind::kPropertyGet,
           [](AddIn& self, Args&) {
             return Variant(self.description_.help_text);
           }},
          {orel::add_in::kRteText, "RteText", CallKind::kPropertyGet,
           [](AddIn& self, Args&) {
             return Variant(self.description_.rte_text);
           }},
          {orel::add_in::kIsLanguageAddIn, "IsLanguageAddIn",
           CallKind::kPropertyGet,
           [](AddIn& self, Args&) {
             return Variant(self.description_.language_add_in);
           }},
          {orel::add_in::kIsActive, "IsActive", CallKind::kPropertyGet,
           [](AddIn& self, Args&) {
             return Variant(self.description_.active);
           }},
          {automation::kNamedOnly, orel::add_in::kReadSetting,
           CallKind::kMethod,
           [](AddIn& self, Args& args) {
             return Variant(self.RequireSettings().Read(
                 CStr(RequiredArg(args, 0)), CStr(RequiredArg(args, 1)),
                 CStr(automation::OptionalArg(args, 2, ""))));
           }},
          {automation::kNamedOnly, orel::add_in::kWriteSetting,
           CallKind::kMethod,
           [](AddIn& self, Args& args) {
             self.RequireSettings();
             self.settings_->Write(CStr(RequiredArg(args, 0)),
                                   CStr(RequiredArg(args, 1)),
                                   CStr(RequiredArg(args, 2)));
             return Variant();
           }},
          {automation::kNamedOnly, orel::add_in::kRootRegistryPath,
           CallKind::kPropertyGet,
           [](AddIn& self, Args&) { return Variant(self.RegistryKey()); }},
      });
  return table;
}

}  // namespace host::modeltool
