#include "platform/registry_store.h"

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <optional>
#include <utility>

#include "automation/case_folding.h"
#include "automation/error.h"

namespace platform {
namespace {

using automation::EqualsIgnoreCase;
using automation::FoldCase;

constexpr std::string_view kHeader = "Windows Registry Editor Version 5.00";
constexpr std::string_view kOldHeader = "REGEDIT4";
constexpr std::string_view kBom = "\xEF\xBB\xBF";
constexpr std::string_view kLocalMachine = "HKEY_LOCAL_MACHINE";
constexpr std::string_view kCurrentUser = "HKEY_CURRENT_USER";
// Long hex values wrap as the registry editor wraps them, so written files
// stay readable and exercise continuation lines.
constexpr size_t kHexBytesPerLine = 25;

std::string_view TrimLeft(std::string_view text) {
  size_t start = text.find_first_not_of(" \t");
  return start == std::string_view::npos ? "" : text.substr(start);
}

std::string_view TrimRight(std::string_view text) {
  size_t end = text.find_last_not_of(" \t\r");
  return end == std::string_view::npos ? "" : text.substr(0, end + 1);
}

std::string_view Trim(std::string_view text) {
  return TrimLeft(TrimRight(text));
}

std::vector<std::string_view> Split(std::string_view text, char separator) {
  std::vector<std::string_view> pieces;
  while (true) {
    size_t end = text.find(separator);
    pieces.push_back(text.substr(0, end));
    if (end == std::string_view::npos) return pieces;
    text.remove_prefix(end + 1);
  }
}

bool IsHexDigit(char c) {
  return (c >= '0' && c <= '9') || (c >= 'a' && c <= 'f') ||
         (c >= 'A' && c <= 'F');
}

bool AllHex(std::string_view text) {
  for (char c : text) {
    if (!IsHexDigit(c)) return false;
  }
  return !text.empty();
}

uint32_t HexNumber(std::string_view digits) {
  return static_cast<uint32_t>(std::stoul(std::string(digits), nullptr, 16));
}

// The root named in a section, in either form, or null.
HKEY RootNamed(std::string_view name) {
  if (EqualsIgnoreCase(name, kLocalMachine) || EqualsIgnoreCase(name, "HKLM")) {
    return kHkeyLocalMachine;
  }
  if (EqualsIgnoreCase(name, kCurrentUser) || EqualsIgnoreCase(name, "HKCU")) {
    return kHkeyCurrentUser;
  }
  return nullptr;
}

bool HasLineBreak(std::string_view text) {
  return text.find_first_of("\r\n") != std::string_view::npos;
}

bool ValidKeyPath(std::string_view key) {
  if (key.empty()) return true;
  if (HasLineBreak(key)) return false;
  size_t start = 0;
  while (true) {
    size_t end = key.find('\\', start);
    if (end == start) return false;
    if (end == std::string_view::npos) return start < key.size();
    start = end + 1;
  }
}

// The path of `key` below `root` with the root's long name, or nullopt when
// either is not usable.
std::optional<std::string> FullPath(HKEY root, std::string_view key) {
  std::string path;
  if (root == kHkeyLocalMachine) {
    path = kLocalMachine;
  } else if (root == kHkeyCurrentUser) {
    path = kCurrentUser;
  } else {
    return std::nullopt;
  }
  if (!ValidKeyPath(key)) return std::nullopt;
  if (!key.empty()) path.append("\\").append(key);
  return path;
}

std::string CheckedFullPath(HKEY root, std::string_view key) {
  std::optional<std::string> path = FullPath(root, key);
  if (!path) {
    throw automation::Error(
        automation::kInvalidProcedureCall,
        "Not a registry key below a root: \"" + std::string(key) + "\"");
  }
  return *path;
}

std::string Quote(std::string_view text) {
  std::string quoted = "\"";
  for (char c : text) {
    if (c == '\\' || c == '"') quoted += '\\';
    quoted += c;
  }
  return quoted + "\"";
}

// A string value is written as text when reading the text back gives the
// same bytes; otherwise it falls back to hex(1).
bool WritableAsText(const std::vector<uint8_t>& data) {
  if (data.empty() || data.back() != 0) return false;
  for (size_t i = 0; i + 1 < data.size(); ++i) {
    if (data[i] == 0 || data[i] == '\n' || data[i] == '\r') return false;
  }
  return true;
}

std::string DataText(const RegistryStore::Value& value) {
  char buffer[16];
  if (value.type == kRegSz && WritableAsText(value.data)) {
    return Quote(
        std::string_view(reinterpret_cast<const char*>(value.data.data()),
                         value.data.size() - 1));
  }
  if (value.type == kRegDword && value.data.size() == 4) {
    uint32_t number = value.data[0] | value.data[1] << 8 | value.data[2] << 16 |
                      uint32_t{value.data[3]} << 24;
    std::snprintf(buffer, sizeof buffer, "%08x", number);
    return std::string("dword:") + buffer;
  }
  std::string text = "hex";
  if (value.type != kRegBinary) {
    std::snprintf(buffer, sizeof buffer, "(%x)", value.type);
    text += buffer;
  }
  text += ':';
  for (size_t i = 0; i < value.data.size(); ++i) {
    if (i > 0) text += (i % kHexBytesPerLine == 0) ? ",\\\n  " : ",";
    std::snprintf(buffer, sizeof buffer, "%02x", value.data[i]);
    text += buffer;
  }
  return text;
}

// Reads a `.reg` file line by line into a store. Errors name the file and
// the line where the reading stopped.
class Parser {
 public:
  Parser(std::string_view text, std::string_view file_name)
      : file_name_(file_name) {
    if (text.starts_with(kBom)) text.remove_prefix(kBom.size());
    if (text.ends_with('\n')) text.remove_suffix(1);
    lines_ = Split(text, '\n');
  }

  RegistryStore Run() {
    bool header_seen = false;
    for (line_ = 0; line_ < lines_.size(); ++line_) {
      std::string_view text = Trim(lines_[line_]);
      if (text.empty()) continue;
      if (!header_seen) {
        if (text != kHeader && text != kOldHeader) {
          Fail("expected \"" + std::string(kHeader) + "\"");
        }
        header_seen = true;
      } else if (text[0] == '[') {
        Section(text);
      } else if (text[0] != ';') {
        ValueLine(text);
      }
    }
    return std::move(store_);
  }

 private:
  [[noreturn]] void Fail(const std::string& what) const {
    throw automation::Error(automation::kBadFileFormat,
                            std::string(file_name_) + ":" +
                                std::to_string(line_ + 1) + ": " + what);
  }

  void Section(std::string_view text) {
    if (text.back() != ']') Fail("section without a closing ']'");
    std::string_view inner = text.substr(1, text.size() - 2);
    bool remove = inner.starts_with('-');
    if (remove) inner.remove_prefix(1);
    size_t slash = inner.find('\\');
    std::string_view root_name = inner.substr(0, slash);
    HKEY root = RootNamed(root_name);
    if (root == nullptr)
      Fail("unknown root \"" + std::string(root_name) + "\"");
    std::string_view key;
    if (slash != std::string_view::npos) {
      key = inner.substr(slash + 1);
      if (key.empty() || !ValidKeyPath(key)) Fail("empty key name in section");
    }
    root_ = nullptr;
    if (remove) {
      store_.RemoveKey(root, key);
    } else {
      store_.AddKey(root, key);
      root_ = root;
      key_ = key;
    }
  }

  void ValueLine(std::string_view text) {
    std::string name;
    if (text[0] == '@') {
      text.remove_prefix(1);
    } else if (text[0] == '"') {
      name = Quoted(text);
    } else {
      Fail("expected a quoted value name or @");
    }
    text = TrimLeft(text);
    if (!text.starts_with('=')) Fail("expected '=' after the value name");
    text = TrimLeft(text.substr(1));
    if (root_ == nullptr) Fail("value outside a key section");

    if (text == "-") {
      store_.RemoveValue(root_, key_, name);
    } else if (text.starts_with('"')) {
      std::string value = Quoted(text);
      if (!text.empty()) Fail("unexpected text after the quoted value");
      std::vector<uint8_t> data(value.begin(), value.end());
      data.push_back(0);
      store_.Set(root_, key_, name, kRegSz, std::move(data));
    } else if (automation::StartsWithIgnoreCase(text, "dword:")) {
      store_.Set(root_, key_, name, kRegDword, Dword(text.substr(6)));
    } else if (automation::StartsWithIgnoreCase(text, "hex")) {
      uint32_t type = HexType(text);
      store_.Set(root_, key_, name, type, HexBytes(text));
    } else {
      Fail("unknown kind of value data");
    }
  }

  // Reads the quoted text `text` starts with and removes it from `text`.
  std::string Quoted(std::string_view& text) {
    std::string value;
    for (size_t i = 1; i < text.size(); ++i) {
      char c = text[i];
      if (c == '"') {
        text = TrimLeft(text.substr(i + 1));
        return value;
      }
      if (c == '\\' && i + 1 < text.size()) {
        c = text[++i];
        if (c != '\\' && c != '"') {
          Fail(std::string("bad escape \"\\") + c + "\"");
        }
      }
      value += c;
    }
    Fail("quoted text without a closing quote");
  }

  std::vector<uint8_t> Dword(std::string_view digits) {
    if (!AllHex(digits)) Fail("bad dword \"" + std::string(digits) + "\"");
    if (digits.size() > 8) {
      Fail("dword out of range \"" + std::string(digits) + "\"");
    }
    uint32_t number = HexNumber(digits);
    return {static_cast<uint8_t>(number), static_cast<uint8_t>(number >> 8),
            static_cast<uint8_t>(number >> 16),
            static_cast<uint8_t>(number >> 24)};
  }

  // Reads "hex:" or "hex(N):" and removes it from `text`.
  uint32_t HexType(std::string_view& text) {
    text.remove_prefix(3);
    uint32_t type = kRegBinary;
    if (text.starts_with('(')) {
      size_t close = text.find(')');
      if (close == std::string_view::npos) Fail("bad value type in hex(...)");
      std::string_view digits = text.substr(1, close - 1);
      if (!AllHex(digits) || digits.size() > 8) {
        Fail("bad value type in hex(...)");
      }
      type = HexNumber(digits);
      text.remove_prefix(close + 1);
    }
    if (!text.starts_with(':')) Fail("expected ':' after hex");
    text.remove_prefix(1);
    return type;
  }

  // Reads comma-separated bytes; a line ending in '\' continues on the next.
  std::vector<uint8_t> HexBytes(std::string_view piece) {
    std::vector<uint8_t> bytes;
    while (true) {
      piece = Trim(piece);
      bool continued = piece.ends_with('\\');
      if (continued) piece = TrimRight(piece.substr(0, piece.size() - 1));
      std::vector<std::string_view> tokens;
      if (!piece.empty()) tokens = Split(piece, ',');
      for (size_t i = 0; i < tokens.size(); ++i) {
        std::string_view byte = Trim(tokens[i]);
        if (byte.empty() && continued && i + 1 == tokens.size()) break;
        if (byte.empty()) Fail("missing byte in hex data");
        if (!AllHex(byte) || byte.size() > 2) {
          Fail("bad hex byte \"" + std::string(byte) + "\"");
        }
        bytes.push_back(static_cast<uint8_t>(HexNumber(byte)));
      }
      if (!continued) return bytes;
      if (line_ + 1 == lines_.size()) {
        Fail("hex data continued past the end of the file");
      }
      piece = lines_[++line_];
      if (Trim(piece).empty()) Fail("hex data continued onto a blank line");
    }
  }

  std::string_view file_name_;
  std::vector<std::string_view> lines_;
  size_t line_ = 0;
  RegistryStore store_;
  HKEY root_ = nullptr;  // of the section values go to; null outside one
  std::string key_;
};

}  // namespace

RegistryStore RegistryStore::Parse(std::string_view text,
                                   std::string_view file_name) {
  return Parser(text, file_name).Run();
}

RegistryStore RegistryStore::Load(const std::string& path) {
  std::error_code error;
  std::filesystem::file_status status = std::filesystem::status(path, error);
  if (status.type() == std::filesystem::file_type::not_found) return {};
  std::ifstream in;
  if (!error && !std::filesystem::is_directory(status)) {
    in.open(path, std::ios::binary);
  }
  std::string text;
  if (in) text.assign(std::istreambuf_iterator<char>(in), {});
  if (!in.is_open() || in.bad()) {
    throw automation::Error(automation::kPathFileAccessError,
                            path + ": cannot read the registry file");
  }
  return Parse(text, path);
}

std::string RegistryStore::ToText() const {
  std::string text(kHeader);
  text += '\n';
  for (const auto& [folded, key] : keys_) {
    text += "\n[" + key.path + "]\n";
    for (const auto& [folded_name, value] : key.values) {
      text += value.name.empty() ? "@" : Quote(value.name);
      text += '=' + DataText(value) + '\n';
    }
  }
  return text;
}

void RegistryStore::AddKey(HKEY root, std::string_view key) {
  AddKeyAt(CheckedFullPath(root, key));
}

void RegistryStore::RemoveKey(HKEY root, std::string_view key) {
  std::string folded = FoldCase(CheckedFullPath(root, key));
  keys_.erase(folded);
  folded += '\\';
  auto below = keys_.lower_bound(folded);
  while (below != keys_.end() && below->first.starts_with(folded)) {
    below = keys_.erase(below);
  }
}

void RegistryStore::RemoveValue(HKEY root, std::string_view key,
                                std::string_view name) {
  auto found = keys_.find(FoldCase(CheckedFullPath(root, key)));
  if (found != keys_.end()) found->second.values.erase(FoldCase(name));
}

void RegistryStore::Set(HKEY root, std::string_view key, std::string_view name,
                        uint32_t type, std::vector<uint8_t> data) {
  if (HasLineBreak(name)) {
    throw automation::Error(automation::kInvalidProcedureCall,
                            "A registry value name cannot hold a line break");
  }
  Key& added = AddKeyAt(CheckedFullPath(root, key));
  added.values[FoldCase(name)] =
      Value{std::string(name), type, std::move(data)};
}

void RegistryStore::SetString(HKEY root, std::string_view key,
                              std::string_view name, std::string_view text) {
  std::vector<uint8_t> data(text.begin(), text.end());
  data.push_back(0);
  Set(root, key, name, kRegSz, std::move(data));
}

void RegistryStore::SetDword(HKEY root, std::string_view key,
                             std::string_view name, uint32_t number) {
  Set(root, key, name, kRegDword,
      {static_cast<uint8_t>(number), static_cast<uint8_t>(number >> 8),
       static_cast<uint8_t>(number >> 16), static_cast<uint8_t>(number >> 24)});
}

bool RegistryStore::HasKey(HKEY root, std::string_view key) const {
  std::optional<std::string> path = FullPath(root, key);
  if (!path) return false;
  if (key.empty()) return true;
  std::string folded = FoldCase(*path);
  if (keys_.contains(folded)) return true;
  folded += '\\';
  auto below = keys_.lower_bound(folded);
  return below != keys_.end() && below->first.starts_with(folded);
}

const RegistryStore::Value* RegistryStore::FindValue(
    HKEY root, std::string_view key, std::string_view name) const {
  const Key* found = FindKey(root, key);
  if (found == nullptr) return nullptr;
  auto value = found->values.find(FoldCase(name));
  return value == found->values.end() ? nullptr : &value->second;
}

RegistryStore::Key& RegistryStore::AddKeyAt(const std::string& path) {
  return keys_.try_emplace(FoldCase(path), Key{path, {}}).first->second;
}

const RegistryStore::Key* RegistryStore::FindKey(HKEY root,
                                                 std::string_view key) const {
  std::optional<std::string> path = FullPath(root, key);
  if (!path) return nullptr;
  auto found = keys_.find(FoldCase(*path));
  return found == keys_.end() ? nullptr : &found->second;
}

}  // namespace platform
