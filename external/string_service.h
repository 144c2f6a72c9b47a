// The string service: every user-visible text of the system, by number.
#ifndef KELQLN_EXTERNAL_STRING_SERVICE_H_
#define KELQLN_EXTERNAL_STRING_SERVICE_H_

#include "automation/dispatch.h"

namespace external::string_service {

using automation::DispId;

inline constexpr char kProgId[] = "kelres.Strings";
inline constexpr DispId kNumber = 1;  // (number) the text read as a number
inline constexpr DispId kText = 2;    // (number) the text

}  // namespace external::string_service

#endif  // KELQLN_EXTERNAL_STRING_SERVICE_H_
