// The tool's collections: a live, read-only view of a list that an owner
// keeps (a package's classes, a class's components...), numbered from 1.
// Making one copies nothing, so handing out a collection of a large model is
// cheap, and it follows later changes of the list. Names compare exactly.
// Count 202, item 203(position), index of a name 205(name) (0: none), first
// by name 212(name), by unique id 213(id) (Nothing: none).
#ifndef KELQLN_HOST_MODELTOOL_ELEMENT_COLLECTION_H_
#define KELQLN_HOST_MODELTOOL_ELEMENT_COLLECTION_H_

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "automation/error.h"
#include "automation/member_table.h"
#include "external/orel.h"

namespace host::modeltool {

template <class T>
std::shared_ptr<T> Lock(const std::shared_ptr<T>& item) {
  return item;
}
template <class T>
std::shared_ptr<T> Lock(const std::weak_ptr<T>& item) {
  return item.lock();
}

// T is any item with Name() (elements, tool properties, add-ins); the list
// holds shared_ptr<T> or weak_ptr<T>.
template <class T, class Pointer = std::shared_ptr<T>>
class ElementCollection
    : public automation::DispatchImpl<ElementCollection<T, Pointer>> {
 public:
  using Items = std::vector<Pointer>;
  using Finder = std::function<std::shared_ptr<T>(std::string_view id)>;

  // `items` points into its owner and keeps it alive (an aliasing pointer,
  // see Of). `by_unique_id` replaces the walk through the list for lists
  // with an index of their own.
  explicit ElementCollection(std::shared_ptr<const Items> items,
                             Finder by_unique_id = {})
      : items_(std::move(items)), by_unique_id_(std::move(by_unique_id)) {}

  // The collection object of `owner`'s list `items`.
  template <class Owner>
  static std::shared_ptr<ElementCollection> Of(std::shared_ptr<Owner> owner,
                                               const Items& items,
                                               Finder by_unique_id = {}) {
    return std::make_shared<ElementCollection>(
        std::shared_ptr<const Items>(std::move(owner), &items),
        std::move(by_unique_id));
  }

  int32_t Count() const { return static_cast<int32_t>(items_->size()); }

  // kSubscriptOutOfRange outside 1..Count.
  std::shared_ptr<T> At(int32_t position) const {
    if (position < 1 || position > Count()) {
      throw automation::Error(automation::kSubscriptOutOfRange);
    }
    return Lock((*items_)[position - 1]);
  }

  int32_t IndexOfName(std::string_view name) const {
    for (size_t i = 0; i < items_->size(); ++i) {
      auto item = Lock((*items_)[i]);
      if (item && item->Name() == name) return static_cast<int32_t>(i + 1);
    }
    return 0;
  }

  std::shared_ptr<T> FindByName(std::string_view name) const {
    int32_t index = IndexOfName(name);
    return index == 0 ? nullptr : At(index);
  }

  std::shared_ptr<T> FindByUniqueId(std::string_view id) const {
    if (by_unique_id_) return by_unique_id_(id);
    if constexpr (requires(const T& item) { item.UniqueId(); }) {
      for (const Pointer& pointer : *items_) {
        auto item = Lock(pointer);
        if (item && item->UniqueId() == id) return item;
      }
    }
    return nullptr;
  }

  static const automation::MemberTable<ElementCollection>& Members() {
    using automation::Args;
    using automation::CallKind;
    using automation::Variant;
    namespace names = external::orel::collection;
    static const automation::MemberTable<ElementCollection> table(
        "ElementCollection",
        {
            {names::kCount, "Count", CallKind::kPropertyGet,
             [](ElementCollection& self, Args&) {
               return Variant(self.Count());
             }},
            {names::kGetAt, "GetAt", CallKind::kMethod,
             [](ElementCollection& self, Args& args) {
               return Variant(
                   self.At(automation::CLng(automation::RequiredArg(args, 0))));
             }},
            {automation::kDispIdValue, "Item", CallKind::kMethod,
             [](ElementCollection& self, Args& args) {
               return Variant(
                   self.At(automation::CLng(automation::RequiredArg(args, 0))));
             }},
            {names::kIndexOfName, "IndexOfName", CallKind::kMethod,
             [](ElementCollection& self, Args& args) {
               return Variant(self.IndexOfName(
                   automation::CStr(automation::RequiredArg(args, 0))));
             }},
            {names::kFindByName, "FindByName", CallKind::kMethod,
             [](ElementCollection& self, Args& args) {
               return Variant(self.FindByName(
                   automation::CStr(automation::RequiredArg(args, 0))));
             }},
            {names::kFindByUniqueId, "FindByUniqueId", CallKind::kMethod,
             [](ElementCollection& self, Args& args) {
               return Variant(self.FindByUniqueId(
                   automation::CStr(automation::RequiredArg(args, 0))));
             }},
        });
    return table;
  }

 private:
  std::shared_ptr<const Items> items_;
  Finder by_unique_id_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_ELEMENT_COLLECTION_H_
