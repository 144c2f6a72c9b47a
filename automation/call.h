// The late-bound call helpers every caller uses: by member number or by name,
// with arguments by value, or with an Args vector whose elements the callee
// may rewrite (by-reference arguments). A call on Nothing raises 91.
#ifndef KELQLN_AUTOMATION_CALL_H_
#define KELQLN_AUTOMATION_CALL_H_

#include <string_view>
#include <utility>

#include "automation/dispatch.h"

namespace automation {

Variant Invoke(const Object& object, DispId id, CallKind kind, Args& args);
Variant InvokeByName(const Object& object, std::string_view name,
                     CallKind kind, Args& args);

template <class... A>
Variant Call(const Object& object, DispId id, A&&... args) {
  Args list{Variant(std::forward<A>(args))...};
  return Invoke(object, id, CallKind::kMethod, list);
}

template <class... A>
Variant CallByName(const Object& object, std::string_view name, A&&... args) {
  Args list{Variant(std::forward<A>(args))...};
  return InvokeByName(object, name, CallKind::kMethod, list);
}

template <class... A>
Variant Get(const Object& object, DispId id, A&&... args) {
  Args list{Variant(std::forward<A>(args))...};
  return Invoke(object, id, CallKind::kPropertyGet, list);
}

template <class... A>
Variant GetByName(const Object& object, std::string_view name, A&&... args) {
  Args list{Variant(std::forward<A>(args))...};
  return InvokeByName(object, name, CallKind::kPropertyGet, list);
}

// Property puts: the value is the last argument after any index arguments.
void Let(const Object& object, DispId id, Variant value);
void LetByName(const Object& object, std::string_view name, Variant value);
void Set(const Object& object, DispId id, Object value);
void SetByName(const Object& object, std::string_view name, Object value);

// A property read as an object (424 when the member gives no object).
template <class... A>
Object GetObject(const Object& object, DispId id, A&&... args) {
  return CObj(Get(object, id, std::forward<A>(args)...));
}

}  // namespace automation

#endif  // KELQLN_AUTOMATION_CALL_H_
