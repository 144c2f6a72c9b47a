#include "host/codeview/add_in_settings.h"

#include <utility>

#include "automation/case_folding.h"
#include "entry/add_in_services.h"
#include "platform/registry.h"
#include "shared/string_utilities.h"

namespace host::codeview {

AddInSettings::AddInSettings(std::string name, std::string registry_key)
    : name_(std::move(name)), registry_key_(std::move(registry_key)) {}

int32_t AddInSettings::ShouldBackupModel() const {
  return Number("ShouldBackupModel");
}

bool AddInSettings::SupportsNewComponent() const {
  return Number("SupportsNewComponent") != 0;
}

std::string AddInSettings::NewComponentName() const {
  std::string name = kelqln::Trim(Text("NewComponentName"));
  return name.empty() ? "NewComponent" : name;
}

std::vector<std::string> AddInSettings::RefusedStereotypes() const {
  return List("RefusedStereotypes");
}

std::string AddInSettings::LanguageInfo() const { return Text("LanguageInfo"); }

std::vector<std::string> AddInSettings::IconStereotypes() const {
  return List("IconStereotypes");
}

bool AddInSettings::Fails(std::string_view member) const {
  for (const std::string& name : List("FailingMembers")) {
    if (automation::EqualsIgnoreCase(name, member)) return true;
  }
  return false;
}

std::string AddInSettings::Text(std::string_view value_name) const {
  if (!IsConnected()) return "";
  automation::Variant value = kelqln::ReadRegistryValue(
      platform::kHkeyLocalMachine, registry_key_, value_name);
  return value.IsString() ? value.StringValue() : "";
}

int32_t AddInSettings::Number(std::string_view value_name) const {
  if (!IsConnected()) return 0;
  automation::Variant value = kelqln::ReadRegistryValue(
      platform::kHkeyLocalMachine, registry_key_, value_name);
  return value.IsNumeric() ? automation::CLng(value) : 0;
}

std::vector<std::string> AddInSettings::List(
    std::string_view value_name) const {
  std::vector<std::string> names;
  std::string text = Text(value_name);
  size_t from = 0;
  while (from <= text.size()) {
    size_t end = text.find(';', from);
    if (end == std::string::npos) end = text.size();
    std::string name =
        kelqln::Trim(std::string_view(text).substr(from, end - from));
    if (!name.empty()) names.push_back(std::move(name));
    from = end + 1;
  }
  return names;
}

}  // namespace host::codeview
