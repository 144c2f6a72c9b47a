// The numbered texts of the string service, read from a text table: one
// "number<TAB>text" per line. Blank lines and lines starting with '#' are
// skipped. In a text, "\n" is a line break, "\t" a tab, "\s" a blank (for a
// text that ends in one, where an editor might drop it) and "\\" a
// backslash; every other character stands for itself.
#ifndef KELQLN_HOST_STRINGS_STRING_TABLE_H_
#define KELQLN_HOST_STRINGS_STRING_TABLE_H_

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace host::strings {

class StringTable {
 public:
  // A malformed line (no tab, a number that is none, a number given twice,
  // an unknown escape) is automation::kBadFileFormat, naming `source` and
  // the line.
  static StringTable Parse(std::string_view text, const std::string& source);
  // kFileNotFound when the file cannot be read.
  static StringTable Load(const std::string& path);

  // The table a new string service of this process uses: the file named by
  // $KELQLN_STRINGS when that is set and not empty (read anew each time, so
  // an edited table needs no rebuild), else the table built into the
  // library.
  static std::shared_ptr<const StringTable> ForThisProcess();

  // The text of `number`, or nullptr.
  const std::string* Find(int32_t number) const;
  // Every number of the table, in ascending order.
  std::vector<int32_t> Numbers() const;

 private:
  std::unordered_map<int32_t, std::string> texts_;
};

// The text of strings.tsv as it was when the library was built.
std::string_view EmbeddedStringTable();

}  // namespace host::strings

#endif  // KELQLN_HOST_STRINGS_STRING_TABLE_H_
