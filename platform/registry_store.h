// The keys and values of a registry, read from and written to the `.reg`
// text format:
//
//   Windows Registry Editor Version 5.00      (or REGEDIT4)
//   ; a comment
//   [HKEY_LOCAL_MACHINE\SOFTWARE\Vendor]   (or HKLM, HKEY_CURRENT_USER, HKCU)
//   @="the default value"
//   "Text"="C:\\path with \"quotes\""
//   "Number"=dword:0000000a
//   "Bytes"=hex:01,02,\   (a trailing backslash: the bytes go on below)
//     ff
//   "Other"=hex(2):41,00,00,00
//
// `[-key]` and `"Name"=-` delete, as when such a file is imported. Key and
// value names compare without regard to letter case.
#ifndef KELQLN_PLATFORM_REGISTRY_STORE_H_
#define KELQLN_PLATFORM_REGISTRY_STORE_H_

#include <cstdint>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "platform/registry.h"

namespace platform {

class RegistryStore {
 public:
  struct Value {
    std::string name;  // "" for the default value
    uint32_t type = kRegNone;
    std::vector<uint8_t> data;
  };

  // Parses `text`; `file_name` only names the source in error messages.
  // Throws automation::Error(kBadFileFormat, "<file>:<line>: <problem>").
  static RegistryStore Parse(std::string_view text, std::string_view file_name);

  // Parses the file at `path`; a missing file is an empty store. Throws as
  // Parse, or kPathFileAccessError when the file cannot be read.
  static RegistryStore Load(const std::string& path);

  // The store in `.reg` form; Parse(ToText()) gives the same store back.
  std::string ToText() const;

  // `root` is kHkeyLocalMachine or kHkeyCurrentUser and `key` a path below it
  // ("" for the root itself); anything else, and names with line breaks,
  // throw kInvalidProcedureCall.
  // Setting a value creates its key.
  void AddKey(HKEY root, std::string_view key);
  // Removes the key with every key below it.
  void RemoveKey(HKEY root, std::string_view key);
  void RemoveValue(HKEY root, std::string_view key, std::string_view name);
  void Set(HKEY root, std::string_view key, std::string_view name,
           uint32_t type, std::vector<uint8_t> data);
  void SetString(HKEY root, std::string_view key, std::string_view name,
                 std::string_view text);
  void SetDword(HKEY root, std::string_view key, std::string_view name,
                uint32_t number);

  // A key exists when it was added or has a key below it.
  bool HasKey(HKEY root, std::string_view key) const;
  // Null when the key or the value does not exist.
  const Value* FindValue(HKEY root, std::string_view key,
                         std::string_view name) const;

 private:
  struct Key {
    std::string path;  // with the root's long name, as first written
    std::map<std::string, Value> values;  // by folded name
  };

  Key& AddKeyAt(const std::string& path);
  const Key* FindKey(HKEY root, std::string_view key) const;

  std::map<std::string, Key> keys_;  // by folded path
};

}  // namespace platform

#endif  // KELQLN_PLATFORM_REGISTRY_STORE_H_
