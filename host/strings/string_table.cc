#include "host/strings/string_table.h"

#include <algorithm>
#include <charconv>
#include <cstdlib>
#include <fstream>
#include <sstream>

#include "automation/error.h"

namespace host::strings {
namespace {

[[noreturn]] void Malformed(const std::string& source, size_t line,
                            const std::string& what) {
  throw automation::Error(automation::kBadFileFormat,
                          source + ":" + std::to_string(line) + ": " + what);
}

std::string Unescape(std::string_view text, const std::string& source,
                     size_t line) {
  std::string out;
  out.reserve(text.size());
  for (size_t i = 0; i < text.size(); ++i) {
    if (text[i] != '\\') {
      out += text[i];
      continue;
    }
    if (++i == text.size()) Malformed(source, line, "a lone \\ at the end");
    switch (text[i]) {
      case 'n':
        out += '\n';
        break;
      case 't':
        out += '\t';
        break;
      case 's':
        out += ' ';
        break;
      case '\\':
        out += '\\';
        break;
      default:
        Malformed(source, line, std::string("unknown escape \\") + text[i]);
    }
  }
  return out;
}

}  // namespace

StringTable StringTable::Parse(std::string_view text,
                               const std::string& source) {
  StringTable table;
  size_t line_number = 0;
  while (!text.empty()) {
    size_t end = text.find('\n');
    std::string_view line = text.substr(0, end);
    text = end == std::string_view::npos ? std::string_view()
                                         : text.substr(end + 1);
    ++line_number;
    if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
    if (line.empty() || line.front() == '#') continue;
    size_t tab = line.find('\t');
    if (tab == std::string_view::npos) {
      Malformed(source, line_number, "no tab between number and text");
    }
    std::string_view digits = line.substr(0, tab);
    int32_t number = 0;
    auto [rest, error] =
        std::from_chars(digits.data(), digits.data() + digits.size(), number);
    if (error != std::errc() || rest != digits.data() + digits.size() ||
        digits.empty()) {
      Malformed(source, line_number,
                "'" + std::string(digits) + "' is not a number");
    }
    bool added = table.texts_
                     .emplace(number, Unescape(line.substr(tab + 1), source,
                                               line_number))
                     .second;
    if (!added) {
      Malformed(source, line_number,
                "number " + std::to_string(number) + " is given twice");
    }
  }
  return table;
}

StringTable StringTable::Load(const std::string& path) {
  std::ifstream in(path, std::ios::binary);
  if (!in) {
    throw automation::Error(automation::kFileNotFound,
                            path + ": the string table cannot be read");
  }
  std::ostringstream content;
  content << in.rdbuf();
  return Parse(content.str(), path);
}

std::shared_ptr<const StringTable> StringTable::ForThisProcess() {
  const char* override_path = std::getenv("KELQLN_STRINGS");
  if (override_path != nullptr && *override_path != '\0') {
    return std::make_shared<const StringTable>(Load(override_path));
  }
  static const std::shared_ptr<const StringTable> built_in =
      std::make_shared<const StringTable>(
          Parse(EmbeddedStringTable(), "strings.tsv (built in)"));
  return built_in;
}

const std::string* StringTable::Find(int32_t number) const {
  auto found = texts_.find(number);
  return found == texts_.end() ? nullptr : &found->second;
}

std::vector<int32_t> StringTable::Numbers() const {
  std::vector<int32_t> numbers;
  numbers.reserve(texts_.size());
  for (const auto& [number, text] : texts_) numbers.push_back(number);
  std::sort(numbers.begin(), numbers.end());
  return numbers;
}

}  // namespace host::strings
