#include "automation/variant.h"

#include <cerrno>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <limits>
#include <string>

#include "automation/case_folding.h"
#include "automation/dispatch.h"
#include "automation/error.h"

namespace automation {

struct VariantAccess {
  static int16_t Int16(const Variant& v) { return std::get<int16_t>(v.value_); }
  static int32_t Int32(const Variant& v) { return std::get<int32_t>(v.value_); }
  static float Float(const Variant& v) { return std::get<float>(v.value_); }
  static double Dbl(const Variant& v) { return std::get<double>(v.value_); }
};

Variant::Variant(bool value)
    : type_(VarType::kBoolean),
      value_(value ? kVariantTrue : kVariantFalse) {}
Variant::Variant(int16_t value) : type_(VarType::kInteger), value_(value) {}
Variant::Variant(int32_t value) : type_(VarType::kLong), value_(value) {}
Variant::Variant(float value) : type_(VarType::kSingle), value_(value) {}
Variant::Variant(double value) : type_(VarType::kDouble), value_(value) {}
Variant::Variant(const char* value)
    : type_(VarType::kString), value_(std::string(value ? value : "")) {}
Variant::Variant(std::string value)
    : type_(VarType::kString), value_(std::move(value)) {}
Variant::Variant(std::string_view value)
    : type_(VarType::kString), value_(std::string(value)) {}
Variant::Variant(std::nullptr_t) : type_(VarType::kObject), value_(Object()) {}
Variant::Variant(Object value)
    : type_(VarType::kObject), value_(std::move(value)) {}

Variant Variant::Null() {
  Variant v;
  v.type_ = VarType::kNull;
  return v;
}

Variant Variant::Missing() {
  Variant v;
  v.type_ = VarType::kMissing;
  return v;
}

bool Variant::IsNumeric() const {
  switch (type_) {
    case VarType::kBoolean:
    case VarType::kInteger:
    case VarType::kLong:
    case VarType::kSingle:
    case VarType::kDouble:
      return true;
    default:
      return false;
  }
}

bool Variant::IsNothing() const {
  return type_ == VarType::kObject && std::get<Object>(value_) == nullptr;
}

const std::string& Variant::StringValue() const {
  if (type_ != VarType::kString) throw Error(kTypeMismatch);
  return std::get<std::string>(value_);
}

const Object& Variant::ObjectValue() const {
  if (type_ != VarType::kObject) throw Error(kTypeMismatch);
  return std::get<Object>(value_);
}

std::string Variant::TypeName() const {
  switch (type_) {
    case VarType::kEmpty:
      return "Empty";
    case VarType::kNull:
      return "Null";
    case VarType::kBoolean:
      return "Boolean";
    case VarType::kInteger:
      return "Integer";
    case VarType::kLong:
      return "Long";
    case VarType::kSingle:
      return "Single";
    case VarType::kDouble:
      return "Double";
    case VarType::kString:
      return "String";
    case VarType::kObject: {
      const Object& object = std::get<Object>(value_);
      return object ? object->TypeName() : "Nothing";
    }
    case VarType::kMissing:
      return "Error";
  }
  return "Empty";
}

namespace {

// printf's %G with the given precision, then VB's exponent form: "1E+07"
// keeps two exponent digits, a mantissa loses trailing zeros.
std::string FormatG(double value, int precision) {
  if (std::isnan(value)) return "NaN";
  if (std::isinf(value)) return value < 0 ? "-Infinity" : "Infinity";
  char buffer[64];
  std::snprintf(buffer, sizeof buffer, "%.*G", precision, value);
  std::string text(buffer);
  if (text == "-0") text = "0";
  return text;
}

// The value of a text as VB reads a number: blanks around it, an optional
// sign, digits with an optional fraction and exponent, or &H / &O forms.
double ParseNumber(const std::string& text) {
  size_t begin = text.find_first_not_of(" \t");
  size_t end = text.find_last_not_of(" \t");
  if (begin == std::string::npos) throw Error(kTypeMismatch);
  std::string trimmed = text.substr(begin, end - begin + 1);
  if (trimmed.size() > 2 && trimmed[0] == '&') {
    int base = 0;
    char tag = trimmed[1];
    if (tag == 'H' || tag == 'h') base = 16;
    if (tag == 'O' || tag == 'o') base = 8;
    if (base != 0) {
      errno = 0;
      char* stop = nullptr;
      unsigned long long raw = std::strtoull(trimmed.c_str() + 2, &stop, base);
      if (*stop != '\0' || errno == ERANGE || raw > 0xffffffffull) {
        throw Error(kTypeMismatch);
      }
      // VB reads &H literals of up to four digits as Integers, longer ones
      // as Longs, so &HFFFF is -1 and &HFFFFFFFF is -1 too.
      if (trimmed.size() - 2 <= (base == 16 ? 4u : 6u) && raw <= 0xffff) {
        return static_cast<int16_t>(static_cast<uint16_t>(raw));
      }
      return static_cast<int32_t>(static_cast<uint32_t>(raw));
    }
  }
  for (char c : trimmed) {
    bool allowed = (c >= '0' && c <= '9') || c == '.' || c == '+' ||
                   c == '-' || c == 'e' || c == 'E';
    if (!allowed) throw Error(kTypeMismatch);
  }
  errno = 0;
  char* stop = nullptr;
  double value = std::strtod(trimmed.c_str(), &stop);
  if (stop == trimmed.c_str() || *stop != '\0') throw Error(kTypeMismatch);
  if (errno == ERANGE && std::isinf(value)) throw Error(kOverflow);
  return value;
}

// The default member's value of an object, as VB evaluates an object in an
// expression.
Variant DefaultValue(const Object& object) {
  if (!object) throw Error(kObjectNotSet);
  Args args;
  try {
    return object->Invoke(kDispIdValue, CallKind::kPropertyGet, args);
  } catch (const Error& error) {
    if (error.Number() == kNoSuchMember) throw Error(kTypeMismatch);
    throw;
  }
}

double ToDouble(const Variant& value) {
  switch (value.Type()) {
    case VarType::kEmpty:
      return 0;
    case VarType::kNull:
      throw Error(kInvalidUseOfNull);
    case VarType::kBoolean:
    case VarType::kInteger:
      return VariantAccess::Int16(value);
    case VarType::kLong:
      return VariantAccess::Int32(value);
    case VarType::kSingle:
      return VariantAccess::Float(value);
    case VarType::kDouble:
      return VariantAccess::Dbl(value);
    case VarType::kString: {
      const std::string& text = value.StringValue();
      if (EqualsIgnoreCase(text, "True")) return -1;
      if (EqualsIgnoreCase(text, "False")) return 0;
      return ParseNumber(text);
    }
    case VarType::kObject:
      return ToDouble(DefaultValue(value.ObjectValue()));
    case VarType::kMissing:
      break;
  }
  throw Error(kTypeMismatch);
}

// Rounds half to even and checks the range of an integer type.
template <class T>
T RoundToInteger(double value) {
  if (std::isnan(value)) throw Error(kOverflow);
  double rounded = std::nearbyint(value);
  if (rounded < std::numeric_limits<T>::min() ||
      rounded > std::numeric_limits<T>::max()) {
    throw Error(kOverflow);
  }
  return static_cast<T>(rounded);
}

}  // namespace

std::string SingleToText(float value) { return FormatG(value, 7); }
std::string DoubleToText(double value) { return FormatG(value, 15); }

std::string CStr(const Variant& value) {
  switch (value.Type()) {
    case VarType::kEmpty:
      return "";
    case VarType::kNull:
      throw Error(kInvalidUseOfNull);
    case VarType::kBoolean:
      return VariantAccess::Int16(value) != 0 ? "True" : "False";
    case VarType::kInteger:
      return std::to_string(VariantAccess::Int16(value));
    case VarType::kLong:
      return std::to_string(VariantAccess::Int32(value));
    case VarType::kSingle:
      return SingleToText(VariantAccess::Float(value));
    case VarType::kDouble:
      return DoubleToText(VariantAccess::Dbl(value));
    case VarType::kString:
      return value.StringValue();
    case VarType::kObject:
      return CStr(DefaultValue(value.ObjectValue()));
    case VarType::kMissing:
      break;
  }
  throw Error(kTypeMismatch);
}

int16_t CInt(const Variant& value) {
  if (value.Type() == VarType::kInteger || value.Type() == VarType::kBoolean) {
    return VariantAccess::Int16(value);
  }
  return RoundToInteger<int16_t>(ToDouble(value));
}

int32_t CLng(const Variant& value) {
  if (value.Type() == VarType::kLong) return VariantAccess::Int32(value);
  return RoundToInteger<int32_t>(ToDouble(value));
}

bool CBool(const Variant& value) { return ToDouble(value) != 0; }

float CSng(const Variant& value) {
  if (value.Type() == VarType::kSingle) return VariantAccess::Float(value);
  double d = ToDouble(value);
  if (std::isfinite(d) && std::fabs(d) > std::numeric_limits<float>::max()) {
    throw Error(kOverflow);
  }
  return static_cast<float>(d);
}

double CDbl(const Variant& value) { return ToDouble(value); }

Object CObj(const Variant& value) {
  if (value.Type() != VarType::kObject) throw Error(kObjectRequired);
  return value.ObjectValue();
}

}  // namespace automation
