// The late-bound object: every call across the system's boundary is an
// Invoke by member number, after an optional look-up of the number by name.
#ifndef KELQLN_AUTOMATION_DISPATCH_H_
#define KELQLN_AUTOMATION_DISPATCH_H_

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "automation/variant.h"

namespace automation {

using DispId = int32_t;

// The default member (a collection's Item, an object's value).
inline constexpr DispId kDispIdValue = 0;

enum class CallKind : uint8_t {
  kMethod,
  kPropertyGet,
  kPropertyPut,     // the value is the last argument
  kPropertyPutRef,  // the same, for an object assigned with Set
};

// The arguments of a call, in the order the caller wrote them. The callee may
// write into any of them: a caller that passed an argument by reference
// copies it back afterwards.
using Args = std::vector<Variant>;

class Dispatch : public std::enable_shared_from_this<Dispatch> {
 public:
  virtual ~Dispatch() = default;

  // Calls member `id`. An unknown member, or a member without that kind of
  // call, raises "Object doesn't support this property or method" (438).
  virtual Variant Invoke(DispId id, CallKind kind, Args& args) = 0;

  // The number of the member called `name`, ignoring case; 438 when none.
  virtual DispId IdOfName(std::string_view name) const = 0;

  // What VB's TypeName says of the object ("Collection", "Dictionary"...).
  virtual std::string TypeName() const = 0;
};

// Argument access for member handlers: a required argument that was not
// given (or given as Missing) is "Argument not optional" (449).
const Variant& RequiredArg(const Args& args, size_t index);
// An optional argument, or `fallback` when it was not given.
Variant OptionalArg(const Args& args, size_t index, Variant fallback = {});
// The value of a property put: the last argument.
const Variant& PutValue(const Args& args);

}  // namespace automation

#endif  // KELQLN_AUTOMATION_DISPATCH_H_
