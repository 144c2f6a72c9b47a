// The one place where text is compared without regard to letter case.
// Only ASCII letters fold, as in the binary-safe comparisons of automation
// collections, registry key names and member names.
#ifndef KELQLN_AUTOMATION_CASE_FOLDING_H_
#define KELQLN_AUTOMATION_CASE_FOLDING_H_

#include <string>
#include <string_view>

namespace automation {

// `text` with ASCII upper-case letters turned to lower case.
std::string FoldCase(std::string_view text);

bool EqualsIgnoreCase(std::string_view a, std::string_view b);

// True when `text` begins with `prefix`, ignoring case.
bool StartsWithIgnoreCase(std::string_view text, std::string_view prefix);

// Hash and equality for unordered containers keyed by text without case.
struct FoldedHash {
  using is_transparent = void;
  size_t operator()(std::string_view text) const;
};
struct FoldedEqual {
  using is_transparent = void;
  bool operator()(std::string_view a, std::string_view b) const {
    return EqualsIgnoreCase(a, b);
  }
};

}  // namespace automation

#endif  // KELQLN_AUTOMATION_CASE_FOLDING_H_
