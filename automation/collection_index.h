// What VB's Collection accepts where it looks an item up: a position counted
// from 1, or a text key.
#ifndef KELQLN_AUTOMATION_COLLECTION_INDEX_H_
#define KELQLN_AUTOMATION_COLLECTION_INDEX_H_

#include <cstdint>
#include <string>
#include <string_view>

#include "automation/variant.h"

namespace automation {

class CollectionIndex {
 public:
  CollectionIndex(int32_t position) : position_(position) {}
  CollectionIndex(const char* key) : is_key_(true), key_(key) {}
  CollectionIndex(std::string key) : is_key_(true), key_(std::move(key)) {}
  CollectionIndex(std::string_view key) : is_key_(true), key_(key) {}

  // A text is a key; a number is a position (rounded as CLng rounds);
  // anything else is a type mismatch (13).
  static CollectionIndex FromVariant(const Variant& value);

  bool IsKey() const { return is_key_; }
  int32_t Position() const { return position_; }
  const std::string& Key() const { return key_; }

 private:
  bool is_key_ = false;
  int32_t position_ = 0;
  std::string key_;
};

}  // namespace automation

#endif  // KELQLN_AUTOMATION_COLLECTION_INDEX_H_
