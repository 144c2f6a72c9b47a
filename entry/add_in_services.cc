#include "entry/add_in_services.h"

#include <cstdint>
#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/error.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "shared/string_utilities.h"

namespace kelqln {
namespace {

namespace orel = external::orel;
using automation::CStr;
using automation::Object;
using automation::Variant;

// Query values, enumerate subkeys, read control.
constexpr uint32_t kReadAccess = 0x20009;

Variant QueryValue(platform::HKEY key, std::string_view value_name) {
  uint32_t type = 0;
  uint32_t size = 0;
  if (platform::RegQueryValueEx(key, value_name, &type, nullptr, &size) !=
      platform::kErrorSuccess) {
    return Variant();
  }
  if (type == platform::kRegSz) {
    if (size < 2) return Variant(std::string());
    std::vector<uint8_t> data(size);
    if (platform::RegQueryValueEx(key, value_name, nullptr, data.data(),
                                  &size) != platform::kErrorSuccess ||
        size < 2) {
      return Variant();
    }
    // The size counts the terminating zero.
    return Variant(std::string(data.begin(), data.begin() + (size - 1)));
  }
  if (type == platform::kRegDword) {
    uint32_t number = 0;
    size = sizeof(number);
    if (platform::RegQueryValueEx(key, value_name, nullptr,
                                  reinterpret_cast<uint8_t*>(&number),
                                  &size) != platform::kErrorSuccess) {
      return Variant();
    }
    return Variant(static_cast<int32_t>(number));
  }
  return Variant();
}

std::string RegistryKeyOf(const Object& add_in) {
  return CStr(automation::Get(add_in, orel::add_in::kRegistryKey));
}

std::string ReadAddInText(const Object& add_in, std::string_view value_name) {
  return CStr(ReadRegistryValue(platform::kHkeyLocalMachine,
                                RegistryKeyOf(add_in), value_name));
}

}  // namespace

Variant ReadRegistryValue(platform::HKEY root, std::string_view key,
                          std::string_view value_name) {
  platform::HKEY handle = nullptr;
  if (platform::RegOpenKeyEx(root, key, 0, kReadAccess, &handle) !=
      platform::kErrorSuccess) {
    return Variant();
  }
  Variant value = QueryValue(handle, value_name);
  platform::RegCloseKey(handle);
  return value;
}

Object FindAddIn(const Object& application, std::string_view name) {
  try {
    Object add_ins = automation::GetObject(
        automation::GetObject(application, orel::application::kAddInManager),
        orel::add_in_manager::kAddIns);
    int32_t count =
        automation::CLng(automation::Get(add_ins, orel::collection::kCount));
    for (int32_t i = 1; i <= count; ++i) {
      Object add_in =
          automation::GetObject(add_ins, orel::collection::kGetAt, i);
      if (CStr(automation::Get(add_in, orel::add_in::kName)) == name) {
        return add_in;
      }
    }
  } catch (const automation::Error&) {
    // A tool that cannot list its add-ins has none to offer.
  }
  return nullptr;
}

Object GetVSAddIn(const Object& application) {
  return FindAddIn(application, kVSAddInName);
}

Object GetAddInServer(const Object& application, std::string_view add_in_name,
                      std::string_view tag) {
  Object add_in = FindAddIn(application, add_in_name);
  if (!tag.empty() && !IsAddInEnabled(add_in, tag)) return nullptr;
  try {
    return automation::GetObject(add_in, orel::add_in::kServer);
  } catch (const automation::Error&) {
    return nullptr;
  }
}

Object GetRTEServerOf(const Object& server) {
  try {
    Object rte_server = automation::CObj(automation::CallByName(
        server, external::code_view::add_in_server::kGetRteServer));
    if (rte_server) return rte_server;
  } catch (const automation::Error&) {
    // A server without the operation is its own round-trip server.
  }
  return server;
}

bool IsAddInEnabled(const Object& add_in, std::string_view tag) {
  return ReadAddInText(add_in, "Enable" + std::string(tag)) != "No";
}

bool IsRTEAddIn(const Object& application, std::string_view add_in_name,
                std::string_view tag) {
  try {
    Object add_in = FindAddIn(application, add_in_name);
    if (!add_in) return false;
    if (CStr(automation::Get(add_in, orel::add_in::kRteText)).empty()) {
      return false;
    }
    if (!automation::CBool(
            automation::Get(add_in, orel::add_in::kIsLanguageAddIn))) {
      return false;
    }
    if (ReadAddInText(add_in, "IsRTEAddIn") != "Yes" ||
        !automation::CBool(automation::Get(add_in, orel::add_in::kIsActive))) {
      return false;
    }
    return tag.empty() || IsAddInEnabled(add_in, tag);
  } catch (const automation::Error&) {
    return false;
  }
}

std::shared_ptr<automation::Collection> GetAddInServers(
    const Object& application, std::string_view add_in_name,
    std::string_view tag) {
  auto servers = automation::Collection::Create();
  try {
    Object add_in = FindAddIn(application, add_in_name);
    if (!add_in) return servers;
    std::string list_key = RegistryKeyOf(add_in) + "\\AddIns";
    for (int32_t n = 1;; ++n) {
      std::string name = CStr(ReadRegistryValue(platform::kHkeyLocalMachine,
                                                list_key, std::to_string(n)));
      if (name.empty()) break;
      try {
        Object server = GetAddInServer(application, name, tag);
        if (server) servers->Items().Add(Variant(server), name);
      } catch (const automation::Error&) {
        // A listed add-in that is missing or listed twice is left out; the
        // others are still told of the run.
      }
    }
  } catch (const automation::Error&) {
    // An add-in whose key cannot be read lists no others.
  }
  return servers;
}

std::shared_ptr<automation::Collection> GetExcludedClassStereotypes(
    const Object& application) {
  auto stereotypes = automation::Collection::Create();
  try {
    std::string list =
        Trim(ReadAddInText(GetVSAddIn(application), "ExcludeClassStereotypes"));
    size_t from = 0;
    while (from <= list.size()) {
      size_t end = list.find(';', from);
      if (end == std::string::npos) end = list.size();
      std::string name = Trim(std::string_view(list).substr(from, end - from));
      if (!name.empty() && !stereotypes->Items().Contains(name)) {
        stereotypes->Items().Add(Variant(name), name);
      }
      from = end + 1;
    }
  } catch (const automation::Error&) {
    // Without the settings add-in no stereotype is excluded.
  }
  return stereotypes;
}

}  // namespace kelqln
