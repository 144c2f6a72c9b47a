// A class's list of late-bound members, stated once: number, name, kind and
// handler per row. One static table serves every instance of the class.
#ifndef KELQLN_AUTOMATION_MEMBER_TABLE_H_
#define KELQLN_AUTOMATION_MEMBER_TABLE_H_

#include <array>
#include <functional>
#include <initializer_list>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

#include "automation/case_folding.h"
#include "automation/dispatch.h"
#include "automation/error.h"

namespace automation {

// Members known only by name get numbers from this base upwards.
inline constexpr DispId kFirstNamedDispId = 0x40000000;
// A row with this number is reached by name only.
inline constexpr DispId kNamedOnly = -0x7fffffff;

template <class T>
class MemberTable {
 public:
  using Handler = std::function<Variant(T& self, Args& args)>;

  struct Row {
    DispId id;
    std::string name;
    CallKind kind;
    Handler handler;
  };

  MemberTable(std::string type_name, std::initializer_list<Row> rows)
      : MemberTable(std::move(type_name), std::vector<Row>(rows)) {}

  // For classes that share rows with others (a family of classes with common
  // members builds each table from the common rows plus its own).
  MemberTable(std::string type_name, const std::vector<Row>& rows)
      : type_name_(std::move(type_name)) {
    DispId next_named = kFirstNamedDispId;
    for (const Row& row : rows) {
      DispId id = row.id;
      if (id == kNamedOnly) {
        auto known = ids_.find(row.name);
        id = known != ids_.end() ? known->second : next_named++;
      }
      ids_.emplace(row.name, id);
      members_[id][static_cast<size_t>(row.kind)] = row.handler;
    }
  }

  const std::string& TypeName() const { return type_name_; }

  DispId IdOfName(std::string_view name) const {
    auto found = ids_.find(name);
    if (found == ids_.end()) throw Error(kNoSuchMember);
    return found->second;
  }

  Variant Invoke(T& self, DispId id, CallKind kind, Args& args) const {
    auto found = members_.find(id);
    if (found == members_.end()) throw Error(kNoSuchMember);
    const Handler* handler = Pick(found->second, kind);
    if (handler == nullptr) throw Error(kNoSuchMember);
    return (*handler)(self, args);
  }

 private:
  using Kinds = std::array<Handler, 4>;

  // A method call may read a property and a property read may call a
  // parameterless method, as late binding allows; a put may stand for a Set.
  static const Handler* Pick(const Kinds& kinds, CallKind kind) {
    auto at = [&kinds](CallKind k) -> const Handler* {
      const Handler& h = kinds[static_cast<size_t>(k)];
      return h ? &h : nullptr;
    };
    if (const Handler* exact = at(kind)) return exact;
    switch (kind) {
      case CallKind::kMethod:
        return at(CallKind::kPropertyGet);
      case CallKind::kPropertyGet:
        return at(CallKind::kMethod);
      case CallKind::kPropertyPut:
        return at(CallKind::kPropertyPutRef);
      case CallKind::kPropertyPutRef:
        return at(CallKind::kPropertyPut);
    }
    return nullptr;
  }

  std::string type_name_;
  std::unordered_map<DispId, Kinds> members_;
  std::unordered_map<std::string, DispId, FoldedHash, FoldedEqual> ids_;
};

// Base of a class whose members come from a static MemberTable<T> returned by
// `static const MemberTable<T>& T::Members()`.
template <class T>
class DispatchImpl : public Dispatch {
 public:
  Variant Invoke(DispId id, CallKind kind, Args& args) override {
    return T::Members().Invoke(static_cast<T&>(*this), id, kind, args);
  }
  DispId IdOfName(std::string_view name) const override {
    return T::Members().IdOfName(name);
  }
  std::string TypeName() const override { return T::Members().TypeName(); }
};

}  // namespace automation

#endif  // KELQLN_AUTOMATION_MEMBER_TABLE_H_
