#include "automation/collection.h"

#include <optional>
#include <string>

#include "automation/call.h"

namespace automation {
namespace {

std::optional<CollectionIndex> OptionalIndex(const Args& args, size_t i) {
  Variant value = OptionalArg(args, i);
  if (value.IsMissing() || value.IsEmpty()) return std::nullopt;
  return CollectionIndex::FromVariant(value);
}

}  // namespace

const MemberTable<Collection>& Collection::Members() {
  static const MemberTable<Collection> table(
      "Collection",
      {
          {kItem, "Item", CallKind::kMethod,
           [](Collection& self, Args& args) {
             return self.items_.Item(
                 CollectionIndex::FromVariant(RequiredArg(args, 0)));
           }},
          {kAdd, "Add", CallKind::kMethod,
           [](Collection& self, Args& args) {
             Variant item = RequiredArg(args, 0);
             Variant key = OptionalArg(args, 1);
             std::optional<std::string> text_key;
             if (!key.IsMissing() && !key.IsEmpty()) {
               if (!key.IsString()) throw Error(kTypeMismatch);
               text_key = key.StringValue();
             }
             self.items_.Add(std::move(item), std::move(text_key),
                             OptionalIndex(args, 2), OptionalIndex(args, 3));
             return Variant();
           }},
          {kCount, "Count", CallKind::kPropertyGet,
           [](Collection& self, Args&) {
             return Variant(self.items_.Count());
           }},
          {kRemove, "Remove", CallKind::kMethod,
           [](Collection& self, Args& args) {
             self.items_.Remove(
                 CollectionIndex::FromVariant(RequiredArg(args, 0)));
             return Variant();
           }},
      });
  return table;
}

std::vector<Variant> CollectionItems(const Object& collection) {
  if (auto ours = std::dynamic_pointer_cast<Collection>(collection)) {
    return std::vector<Variant>(ours->Items().begin(), ours->Items().end());
  }
  std::vector<Variant> items;
  int32_t count = CLng(GetByName(collection, "Count"));
  items.reserve(count > 0 ? count : 0);
  for (int32_t i = 1; i <= count; ++i) {
    items.push_back(GetByName(collection, "Item", i));
  }
  return items;
}

}  // namespace automation
