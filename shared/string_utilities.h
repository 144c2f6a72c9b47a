// Text helpers used throughout the engine and the wizard. They keep no state.
#ifndef KELQLN_SHARED_STRING_UTILITIES_H_
#define KELQLN_SHARED_STRING_UTILITIES_H_

#include <string>
#include <string_view>

namespace kelqln {

// True when `text` is empty or holds only blanks (spaces; tabs and other
// white space count as visible, as in the trimming of the original tool).
bool IsBlank(std::string_view text);

// `text` without the blanks (spaces) at both ends.
std::string Trim(std::string_view text);

// `text` with every occurrence of `find` replaced by `replacement`, matched
// case-sensitively from left to right. The search goes on after each inserted
// replacement, so a replacement that contains `find` is not replaced again and
// the call always ends; an empty `find` leaves the text unchanged.
std::string ReplaceAll(std::string_view find, std::string_view replacement,
                       std::string_view text);

}  // namespace kelqln

#endif  // KELQLN_SHARED_STRING_UTILITIES_H_
