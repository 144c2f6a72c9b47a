// VB's Collection for any item type: items numbered from 1 in insertion order,
// optional text keys that match without regard to case (by default), insertion
// before or after an item, look-up and removal by position or key.
//
// Errors are VB's: a key already present is 457, a missing key is 5, a
// position outside 1..Count is 9. Look-up by key is a hash look-up; removal
// and insertion in the middle shift the items after it.
#ifndef KELQLN_AUTOMATION_BASIC_COLLECTION_H_
#define KELQLN_AUTOMATION_BASIC_COLLECTION_H_

#include <cstdint>
#include <iterator>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

#include "automation/case_folding.h"
#include "automation/collection_index.h"
#include "automation/error.h"

namespace automation {

template <class T, class KeyHash = FoldedHash, class KeyEqual = FoldedEqual>
class BasicCollection {
  struct Node {
    T item;
    std::optional<std::string> key;
  };
  using Nodes = std::vector<std::unique_ptr<Node>>;

 public:
  template <class NodeIterator, class Value>
  class Iterator {
   public:
    using iterator_category = std::random_access_iterator_tag;
    using value_type = std::remove_const_t<Value>;
    using difference_type = std::ptrdiff_t;
    using pointer = Value*;
    using reference = Value&;

    Iterator() = default;
    explicit Iterator(NodeIterator at) : at_(at) {}
    reference operator*() const { return (*at_)->item; }
    pointer operator->() const { return &(*at_)->item; }
    Iterator& operator++() {
      ++at_;
      return *this;
    }
    Iterator operator++(int) { return Iterator(at_++); }
    Iterator& operator--() {
      --at_;
      return *this;
    }
    difference_type operator-(const Iterator& other) const {
      return at_ - other.at_;
    }
    bool operator==(const Iterator& other) const { return at_ == other.at_; }

   private:
    NodeIterator at_{};
  };
  using iterator = Iterator<typename Nodes::iterator, T>;
  using const_iterator = Iterator<typename Nodes::const_iterator, const T>;

  BasicCollection() = default;
  BasicCollection(const BasicCollection& other) { CopyFrom(other); }
  BasicCollection& operator=(const BasicCollection& other) {
    if (this != &other) {
      Clear();
      CopyFrom(other);
    }
    return *this;
  }
  BasicCollection(BasicCollection&&) noexcept = default;
  BasicCollection& operator=(BasicCollection&&) noexcept = default;

  int32_t Count() const { return static_cast<int32_t>(nodes_.size()); }
  bool Empty() const { return nodes_.empty(); }

  void Add(T item) { Insert(nodes_.size(), std::move(item), std::nullopt); }
  void Add(T item, std::string key) {
    Insert(nodes_.size(), std::move(item), std::move(key));
  }
  // VB's Add(item, [key], [before], [after]); giving both `before` and
  // `after` is an invalid call (5).
  void Add(T item, std::optional<std::string> key,
           const std::optional<CollectionIndex>& before,
           const std::optional<CollectionIndex>& after = std::nullopt) {
    if (before && after) throw Error(kInvalidProcedureCall);
    size_t at = nodes_.size();
    if (before) at = PositionOf(*before);
    if (after) at = PositionOf(*after) + 1;
    Insert(at, std::move(item), std::move(key));
  }

  T& Item(const CollectionIndex& index) {
    return nodes_[PositionOf(index)]->item;
  }
  const T& Item(const CollectionIndex& index) const {
    return nodes_[PositionOf(index)]->item;
  }

  // The item under `key`, or nullptr: look-up without raising an error.
  T* Find(std::string_view key) {
    auto found = keys_.find(key);
    return found == keys_.end() ? nullptr : &found->second->item;
  }
  const T* Find(std::string_view key) const {
    auto found = keys_.find(key);
    return found == keys_.end() ? nullptr : &found->second->item;
  }
  bool Contains(std::string_view key) const { return keys_.count(key) != 0; }

  // The key of the item at `position` (1-based), if it has one.
  const std::optional<std::string>& KeyAt(int32_t position) const {
    return nodes_[PositionOf(CollectionIndex(position))]->key;
  }

  void Remove(const CollectionIndex& index) {
    size_t at = PositionOf(index);
    if (nodes_[at]->key) keys_.erase(std::string_view(*nodes_[at]->key));
    nodes_.erase(nodes_.begin() + static_cast<std::ptrdiff_t>(at));
  }

  void Clear() {
    keys_.clear();
    nodes_.clear();
  }

  iterator begin() { return iterator(nodes_.begin()); }
  iterator end() { return iterator(nodes_.end()); }
  const_iterator begin() const { return const_iterator(nodes_.begin()); }
  const_iterator end() const { return const_iterator(nodes_.end()); }

 private:
  void CopyFrom(const BasicCollection& other) {
    nodes_.reserve(other.nodes_.size());
    for (const auto& node : other.nodes_) {
      Insert(nodes_.size(), node->item, node->key);
    }
  }

  void Insert(size_t at, T item, std::optional<std::string> key) {
    if (key && keys_.count(std::string_view(*key))) throw Error(kDuplicateKey);
    auto node = std::make_unique<Node>(Node{std::move(item), std::move(key)});
    Node* raw = node.get();
    nodes_.insert(nodes_.begin() + static_cast<std::ptrdiff_t>(at),
                  std::move(node));
    // The map's key views the node's own copy, which never moves.
    if (raw->key) keys_.emplace(std::string_view(*raw->key), raw);
  }

  size_t PositionOf(const CollectionIndex& index) const {
    if (!index.IsKey()) {
      int32_t position = index.Position();
      if (position < 1 || position > Count()) {
        throw Error(kSubscriptOutOfRange);
      }
      return static_cast<size_t>(position - 1);
    }
    auto found = keys_.find(std::string_view(index.Key()));
    if (found == keys_.end()) throw Error(kInvalidProcedureCall);
    for (size_t i = 0; i < nodes_.size(); ++i) {
      if (nodes_[i].get() == found->second) return i;
    }
    throw Error(kInvalidProcedureCall);
  }

  Nodes nodes_;
  std::unordered_map<std::string_view, Node*, KeyHash, KeyEqual> keys_;
};

}  // namespace automation

#endif  // KELQLN_AUTOMATION_BASIC_COLLECTION_H_
