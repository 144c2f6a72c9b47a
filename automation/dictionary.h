// A scripting-style dictionary, for callers that hand over their selection
// that way. Keys are texts or numbers compared exactly, as such dictionaries
// do by default.
#ifndef KELQLN_AUTOMATION_DICTIONARY_H_
#define KELQLN_AUTOMATION_DICTIONARY_H_

#include <functional>
#include <memory>
#include <string_view>
#include <utility>

#include "automation/basic_collection.h"
#include "automation/collection.h"
#include "automation/member_table.h"

namespace automation {

class Dictionary : public DispatchImpl<Dictionary> {
 public:
  static constexpr DispId kItem = 0;
  static constexpr DispId kAdd = 1;
  static constexpr DispId kCount = 2;
  static constexpr DispId kExists = 3;
  static constexpr DispId kItems = 4;
  static constexpr DispId kRemove = 5;
  static constexpr DispId kRemoveAll = 6;
  static constexpr DispId kKeys = 7;
  // A missing key in Remove.
  static constexpr int32_t kElementNotFound = 32811;

  static std::shared_ptr<Dictionary> Create() {
    return std::make_shared<Dictionary>();
  }
  static const MemberTable<Dictionary>& Members();

  void Add(const Variant& key, Variant item);
  bool Exists(const Variant& key) const;
  // The item under `key`; Empty when there is none.
  Variant Item(const Variant& key) const;
  void SetItem(const Variant& key, Variant item);
  void Remove(const Variant& key);
  void RemoveAll() { entries_.Clear(); }
  int32_t Count() const { return entries_.Count(); }
  // New collections of the items and of the keys, in insertion order.
  std::shared_ptr<Collection> Items() const;
  std::shared_ptr<Collection> Keys() const;

 private:
  using Entry = std::pair<Variant, Variant>;  // key, item
  BasicCollection<Entry, std::hash<std::string_view>,
                  std::equal_to<std::string_view>>
      entries_;
};

}  // namespace automation

#endif  // KELQLN_AUTOMATION_DICTIONARY_H_
