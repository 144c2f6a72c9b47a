// Which language add-in a code-view server serves, and how it is set up to
// behave: values under the add-in's registry key (HKEY_LOCAL_MACHINE), read
// at each use so a change takes effect at once. docs/registry.md lists them.
#ifndef KELQLN_HOST_CODEVIEW_ADD_IN_SETTINGS_H_
#define KELQLN_HOST_CODEVIEW_ADD_IN_SETTINGS_H_

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace host::codeview {

class AddInSettings {
 public:
  // A server not connected to an add-in has no name and reads no registry.
  AddInSettings() = default;
  AddInSettings(std::string name, std::string registry_key);

  // The add-in's name, which is its language's name and the tool name of
  // the tool properties it reads and writes.
  const std::string& Name() const { return name_; }
  bool IsConnected() const { return !name_.empty(); }

  // "ShouldBackupModel" (dword): 0 no backup, 1 save, 2 save under a new
  // name. Missing: 0.
  int32_t ShouldBackupModel() const;
  // "SupportsNewComponent" (dword): not 0 when the add-in makes new
  // components. Missing: not supported.
  bool SupportsNewComponent() const;
  // "NewComponentName" (text): the name of a new component. Missing:
  // "NewComponent".
  std::string NewComponentName() const;
  // "RefusedStereotypes" (text, names separated by ";"): elements with one
  // of these stereotypes are left out by the statement generator.
  std::vector<std::string> RefusedStereotypes() const;
  // "LanguageInfo" (text); "" when missing.
  std::string LanguageInfo() const;
  // "IconStereotypes" (text, ";"): stereotypes with an icon of their own.
  std::vector<std::string> IconStereotypes() const;
  // "FailingMembers" (text, ";"): members of the round-trip server that
  // raise an error instead of answering, as a broken add-in would.
  bool Fails(std::string_view member) const;

 private:
  std::string Text(std::string_view value_name) const;
  int32_t Number(std::string_view value_name) const;
  std::vector<std::string> List(std::string_view value_name) const;

  std::string name_;
  std::string registry_key_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_ADD_IN_SETTINGS_H_
