#include "automation/error.h"

#include <utility>

namespace automation {

std::string_view StandardDescription(int32_t number) {
  switch (number) {
    case kInvalidProcedureCall:
      return "Invalid procedure call or argument";
    case kOverflow:
      return "Overflow";
    case kSubscriptOutOfRange:
      return "Subscript out of range";
    case kTypeMismatch:
      return "Type mismatch";
    case kErrorLoadingDll:
      return "Error in loading DLL";
    case kFileNotFound:
      return "File not found";
    case kPathFileAccessError:
      return "Path/File access error";
    case kBadFileFormat:
      return "Invalid file format";
    case kObjectNotSet:
      return "Object variable or With block variable not set";
    case kInvalidUseOfNull:
      return "Invalid use of Null";
    case kObjectRequired:
      return "Object required";
    case kCannotCreateObject:
      return "ActiveX component can't create object";
    case kNoSuchMember:
      return "Object doesn't support this property or method";
    case kArgumentNotOptional:
      return "Argument not optional";
    case kWrongArgumentCount:
      return "Wrong number of arguments or invalid property assignment";
    case kDuplicateKey:
      return "This key is already associated with an element of this "
             "collection";
    default:
      return "";
  }
}

Error::Error(int32_t number)
    : Error(number, std::string(StandardDescription(number))) {}

Error::Error(int32_t number, std::string description, std::string source)
    : number_(number),
      description_(std::move(description)),
      source_(std::move(source)) {
  if (description_.empty()) {
    description_ = "Application-defined or object-defined error";
  }
}

}  // namespace automation
