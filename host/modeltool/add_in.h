// An add-in of the modelling tool as the add-in manager lists it: a name, the
// registry key its settings live under, two flags, two texts and a server
// object made by programmatic identifier. The add-in named "VisualStudio" is
// also the settings store of the system's wizard.
#ifndef KELQLN_HOST_MODELTOOL_ADD_IN_H_
#define KELQLN_HOST_MODELTOOL_ADD_IN_H_

#include <memory>
#include <string>
#include <string_view>

#include "automation/member_table.h"
#include "host/modeltool/settings_store.h"

namespace host::modeltool {

// The tool's add-in keys, below HKEY_LOCAL_MACHINE.
inline constexpr char kAddInsKey[] = "SOFTWARE\\Quenta Software\\Orel\\AddIns";
// The add-in that keeps the settings.
inline constexpr char kSettingsAddInName[] = "VisualStudio";

struct AddInDescription {
  std::string name;
  // "" stands for kAddInsKey + "\" + name.
  std::string registry_key;
  bool active = true;
  bool language_add_in = false;
  // "": the add-in has no server.
  std::string server_prog_id;
  std::string help_text;
  std::string rte_text;
};

class AddIn : public automation::DispatchImpl<AddIn> {
 public:
  explicit AddIn(AddInDescription description);

  static const automation::MemberTable<AddIn>& Members();

  const std::string& Name() const { return description_.name; }
  const AddInDescription& Description() const { return description_; }
  std::string RegistryKey() const;

  // The server object: the one set with SetServer, else the object made by
  // automation::CreateObject(server ProgId) on first use and kept; a server
  // that answers "OnConnection" is first given this add-in by that call. A
  // failed creation or connection raises its error (and the next call tries
  // again); an add-in without ProgId raises kCannotCreateObject.
  automation::Object Server();
  void SetServer(automation::Object server) { server_ = std::move(server); }

  // With a store the add-in answers ReadSetting and WriteSetting; without
  // one those members raise kNoSuchMember.
  void SetSettingsStore(std::shared_ptr<SettingsStore> store) {
    settings_ = std::move(store);
  }
  const std::shared_ptr<SettingsStore>& Settings() const { return settings_; }

 private:
  const SettingsStore& RequireSettings() const;
  // Whether `object` has a member called `name`.
  static bool Answers(const automation::Object& object, std::string_view name);

  AddInDescription description_;
  automation::Object server_;
  std::shared_ptr<SettingsStore> settings_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_ADD_IN_H_
