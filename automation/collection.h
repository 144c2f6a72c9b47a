// VB's Collection object as it crosses to callers: a BasicCollection of
// Variants answering Item (0), Add (1), Count (2) and Remove (3).
#ifndef KELQLN_AUTOMATION_COLLECTION_H_
#define KELQLN_AUTOMATION_COLLECTION_H_

#include <memory>
#include <vector>

#include "automation/basic_collection.h"
#include "automation/member_table.h"

namespace automation {

class Collection : public DispatchImpl<Collection> {
 public:
  static constexpr DispId kItem = 0;
  static constexpr DispId kAdd = 1;
  static constexpr DispId kCount = 2;
  static constexpr DispId kRemove = 3;

  static std::shared_ptr<Collection> Create() {
    return std::make_shared<Collection>();
  }
  static const MemberTable<Collection>& Members();

  BasicCollection<Variant>& Items() { return items_; }
  const BasicCollection<Variant>& Items() const { return items_; }

 private:
  BasicCollection<Variant> items_;
};

// The items of any collection object: ours directly, any other through its
// "Count" and "Item" members, in order.
std::vector<Variant> CollectionItems(const Object& collection);

}  // namespace automation

#endif  // KELQLN_AUTOMATION_COLLECTION_H_
