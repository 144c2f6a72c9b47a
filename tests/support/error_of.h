// The number of the automation error a call raises (0 when it raises none),
// optionally with its description: the one way tests check VB error numbers.
#ifndef KELQLN_TESTS_SUPPORT_ERROR_OF_H_
#define KELQLN_TESTS_SUPPORT_ERROR_OF_H_

#include <functional>
#include <string>

#include "automation/error.h"

namespace testing_support {

inline int ErrorOf(const std::function<void()>& call,
                   std::string* description = nullptr) {
  try {
    call();
  } catch (const automation::Error& error) {
    if (description) *description = error.Description();
    return error.Number();
  }
  return 0;
}

}  // namespace testing_support

#endif  // KELQLN_TESTS_SUPPORT_ERROR_OF_H_
