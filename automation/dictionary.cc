#include "automation/dictionary.h"

#include <string>

#include "automation/collection.h"
#include "automation/error.h"

namespace automation {
namespace {

// Texts and numbers are distinct keys even when they print alike.
std::string KeyText(const Variant& key) {
  if (key.IsString()) return "s" + key.StringValue();
  if (key.IsNumeric()) return "n" + DoubleToText(CDbl(key));
  if (key.IsEmpty()) return "e";
  throw Error(kTypeMismatch);
}

}  // namespace

void Dictionary::Add(const Variant& key, Variant item) {
  entries_.Add(Entry{key, std::move(item)}, KeyText(key));
}

bool Dictionary::Exists(const Variant& key) const {
  return entries_.Contains(KeyText(key));
}

Variant Dictionary::Item(const Variant& key) const {
  const Entry* entry = entries_.Find(KeyText(key));
  return entry ? entry->second : Variant();
}

void Dictionary::SetItem(const Variant& key, Variant item) {
  if (Entry* entry = entries_.Find(KeyText(key))) {
    entry->second = std::move(item);
  } else {
    Add(key, std::move(item));
  }
}

void Dictionary::Remove(const Variant& key) {
  std::string text = KeyText(key);
  if (!entries_.Contains(text)) {
    throw Error(kElementNotFound, "Element not found");
  }
  entries_.Remove(CollectionIndex(text));
}

std::shared_ptr<Collection> Dictionary::Items() const {
  auto items = Collection::Create();
  for (const Entry& entry : entries_) items->Items().Add(entry.second);
  return items;
}

std::shared_ptr<Collection> Dictionary::Keys() const {
  auto keys = Collection::Create();
  for (const Entry& entry : entries_) keys->Items().Add(entry.first);
  return keys;
}

const MemberTable<Dictionary>& Dictionary::Members() {
  using D = Dictionary;
  static const MemberTable<Dictionary> table(
      "Dictionary",
      {
          {kItem, "Item", CallKind::kPropertyGet,
           [](D& self, Args& args) { return self.Item(RequiredArg(args, 0)); }},
          {kItem, "Item", CallKind::kPropertyPut,
           [](D& self, Args& args) {
             self.SetItem(RequiredArg(args, 0), PutValue(args));
             return Variant();
           }},
          {kAdd, "Add", CallKind::kMethod,
           [](D& self, Args& args) {
             self.Add(RequiredArg(args, 0), RequiredArg(args, 1));
             return Variant();
           }},
          {kCount, "Count", CallKind::kPropertyGet,
           [](D& self, Args&) { return Variant(self.Count()); }},
          {kExists, "Exists", CallKind::kMethod,
           [](D& self, Args& args) {
             return Variant(self.Exists(RequiredArg(args, 0)));
           }},
          {kItems, "Items", CallKind::kMethod,
           [](D& self, Args&) { return Variant(self.Items()); }},
          {kRemove, "Remove", CallKind::kMethod,
           [](D& self, Args& args) {
             self.Remove(RequiredArg(args, 0));
             return Variant();
           }},
          {kRemoveAll, "RemoveAll", CallKind::kMethod,
           [](D& self, Args&) {
             self.RemoveAll();
             return Variant();
           }},
          {kKeys, "Keys", CallKind::kMethod,
           [](D& self, Args&) { return Variant(self.Keys()); }},
      });
  return table;
}

}  // namespace automation
