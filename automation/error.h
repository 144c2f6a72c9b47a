// The one exception type of the whole system: an automation error with a
// Visual Basic error number, a description and the source that raised it.
#ifndef KELQLN_AUTOMATION_ERROR_H_
#define KELQLN_AUTOMATION_ERROR_H_

#include <cstdint>
#include <exception>
#include <string>
#include <string_view>

namespace automation {

// Error numbers with fixed meanings. The descriptions live in one table
// (StandardDescription) so every layer raises them with the same words.
enum ErrorNumber : int32_t {
  kInvalidProcedureCall = 5,
  kOverflow = 6,
  kSubscriptOutOfRange = 9,
  kTypeMismatch = 13,
  kErrorLoadingDll = 48,
  kFileNotFound = 53,
  kPathFileAccessError = 75,
  kBadFileFormat = 321,
  kObjectNotSet = 91,
  kInvalidUseOfNull = 94,
  kObjectRequired = 424,
  kCannotCreateObject = 429,
  kNoSuchMember = 438,
  kArgumentNotOptional = 449,
  kWrongArgumentCount = 450,
  kDuplicateKey = 457,
};

// The standard description of a number, or "" when it has none.
std::string_view StandardDescription(int32_t number);

class Error : public std::exception {
 public:
  // An error with the standard description of `number`.
  explicit Error(int32_t number);
  Error(int32_t number, std::string description, std::string source = "");

  int32_t Number() const { return number_; }
  const std::string& Description() const { return description_; }
  const std::string& Source() const { return source_; }
  const char* what() const noexcept override { return description_.c_str(); }

 private:
  int32_t number_;
  std::string description_;
  std::string source_;
};

}  // namespace automation

#endif  // KELQLN_AUTOMATION_ERROR_H_
