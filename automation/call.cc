#include "automation/call.h"

#include "automation/error.h"

namespace automation {

Variant Invoke(const Object& object, DispId id, CallKind kind, Args& args) {
  if (!object) throw Error(kObjectNotSet);
  return object->Invoke(id, kind, args);
}

Variant InvokeByName(const Object& object, std::string_view name,
                     CallKind kind, Args& args) {
  if (!object) throw Error(kObjectNotSet);
  return object->Invoke(object->IdOfName(name), kind, args);
}

void Let(const Object& object, DispId id, Variant value) {
  Args args{std::move(value)};
  Invoke(object, id, CallKind::kPropertyPut, args);
}

void LetByName(const Object& object, std::string_view name, Variant value) {
  Args args{std::move(value)};
  InvokeByName(object, name, CallKind::kPropertyPut, args);
}

void Set(const Object& object, DispId id, Object value) {
  Args args{Variant(std::move(value))};
  Invoke(object, id, CallKind::kPropertyPutRef, args);
}

void SetByName(const Object& object, std::string_view name, Object value) {
  Args args{Variant(std::move(value))};
  InvokeByName(object, name, CallKind::kPropertyPutRef, args);
}

}  // namespace automation
