// The value that crosses every late-bound call: a tagged union with the types
// and text forms of Visual Basic.
#ifndef KELQLN_AUTOMATION_VARIANT_H_
#define KELQLN_AUTOMATION_VARIANT_H_

#include <concepts>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <variant>

namespace automation {

class Dispatch;
// A reference to an automation object; nullptr is Nothing.
using Object = std::shared_ptr<Dispatch>;

enum class VarType : uint8_t {
  kEmpty,
  kNull,
  kBoolean,  // 16 bits, True is all bits set (-1)
  kInteger,  // 16-bit signed
  kLong,     // 32-bit signed
  kSingle,
  kDouble,
  kString,  // UTF-8
  kObject,
  kMissing,  // an optional argument the caller left out
};

inline constexpr int16_t kVariantTrue = -1;
inline constexpr int16_t kVariantFalse = 0;

class Variant {
 public:
  Variant() = default;
  Variant(bool value);
  Variant(int16_t value);
  Variant(int32_t value);
  Variant(float value);
  Variant(double value);
  Variant(const char* value);
  Variant(std::string value);
  Variant(std::string_view value);
  Variant(std::nullptr_t);  // Nothing
  Variant(Object value);
  template <class T>
    requires std::derived_from<T, Dispatch>
  Variant(std::shared_ptr<T> value) : Variant(Object(std::move(value))) {}

  static Variant Null();
  static Variant Missing();

  VarType Type() const { return type_; }
  bool IsEmpty() const { return type_ == VarType::kEmpty; }
  bool IsNull() const { return type_ == VarType::kNull; }
  bool IsMissing() const { return type_ == VarType::kMissing; }
  bool IsString() const { return type_ == VarType::kString; }
  bool IsObject() const { return type_ == VarType::kObject; }
  bool IsBoolean() const { return type_ == VarType::kBoolean; }
  bool IsNumeric() const;
  // An object reference that is Nothing.
  bool IsNothing() const;

  // Exact access without conversion; any other type is a type mismatch (13).
  const std::string& StringValue() const;
  const Object& ObjectValue() const;

  // The VB type name of the value: "Empty", "Null", "Boolean", "Integer",
  // "Long", "Single", "Double", "String", "Nothing", the object's own type
  // name, or "Error" for a missing argument.
  std::string TypeName() const;

 private:
  friend struct VariantAccess;
  VarType type_ = VarType::kEmpty;
  std::variant<std::monostate, int16_t, int32_t, float, double, std::string,
               Object>
      value_;
};

// Conversions with Visual Basic's rules: numbers round half to even, a value
// outside the target's range is an overflow (6), text that is no number is a
// type mismatch (13), Null is an invalid use of Null (94), and an object
// converts through its default member.
std::string CStr(const Variant& value);
int16_t CInt(const Variant& value);
int32_t CLng(const Variant& value);
bool CBool(const Variant& value);
float CSng(const Variant& value);
double CDbl(const Variant& value);
// The object of a value: Nothing stays Nothing; anything other than an object
// reference is "Object required" (424).
Object CObj(const Variant& value);

// The shortest text of a Single with at most 7 significant digits, and of a
// Double with at most 15, as VB prints them ("12.5", "0.1", "1E+07").
std::string SingleToText(float value);
std::string DoubleToText(double value);

}  // namespace automation

#endif  // KELQLN_AUTOMATION_VARIANT_H_
