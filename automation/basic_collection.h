// VB's Collection for any item type: items numbered from 1 in insertion order,
// optional text keys that match without regard to case (by default), insertion
// before or after an item, look-up and removal by position or key.
//
// Errors are VB's: a key already present is 457, a missing key is 5, a
// position outside 1..Count is 9. Look-up, adding and removal by key take
// constant time; a look-up by position after removals, and insertion before or
// after an item, close up the items once in linear time.
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
    size_t slot;  // where the node stands in slots_
  };
  // Removal by key leaves an empty slot behind instead of shifting the items
  // after it; the slots are closed up the next time a position is needed.
  using Slots = std::vector<std::unique_ptr<Node>>;

 public:
  template <class SlotIterator, class Value>
  class Iterator {
   public:
    using iterator_category = std::forward_iterator_tag;
    using value_type = std::remove_const_t<Value>;
    using difference_type = std::ptrdiff_t;
    using pointer = Value*;
    using reference = Value&;

    Iterator() = default;
    Iterator(SlotIterator at, SlotIterator end) : at_(at), end_(end) {
      SkipEmpty();
    }
    reference operator*() const { return (*at_)->item; }
    pointer operator->() const { return &(*at_)->item; }
    Iterator& operator++() {
      ++at_;
      SkipEmpty();
      return *this;
    }
    Iterator operator++(int) {
      Iterator before = *this;
      ++*this;
      return before;
    }
    bool operator==(const Iterator& other) const { return at_ == other.at_; }

   private:
    void SkipEmpty() {
      while (at_ != end_ && *at_ == nullptr) ++at_;
    }
    SlotIterator at_{};
    SlotIterator end_{};
  };
  using iterator = Iterator<typename Slots::iterator, T>;
  using const_iterator = Iterator<typename Slots::const_iterator, const T>;

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

  int32_t Count() const { return static_cast<int32_t>(live_); }
  bool Empty() const { return live_ == 0; }

  void Add(T item) { Insert(live_, std::move(item), std::nullopt); }
  void Add(T item, std::string key) {
    Insert(live_, std::move(item), std::move(key));
  }
  // VB's Add(item, [key], [before], [after]); giving both `before` and
  // `after` is an invalid call (5).
  void Add(T item, std::optional<std::string> key,
           const std::optional<CollectionIndex>& before,
           const std::optional<CollectionIndex>& after = std::nullopt) {
    if (before && after) throw Error(kInvalidProcedureCall);
    size_t at = live_;
    if (before) at = PositionOf(*before);
    if (after) at = PositionOf(*after) + 1;
    Insert(at, std::move(item), std::move(key));
  }

  T& Item(const CollectionIndex& index) { return NodeOf(index).item; }
  const T& Item(const CollectionIndex& index) const {
    return NodeOf(index).item;
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
    return NodeOf(CollectionIndex(position)).key;
  }

  void Remove(const CollectionIndex& index) {
    Node& node = NodeOf(index);
    if (node.key) keys_.erase(std::string_view(*node.key));
    size_t slot = node.slot;
    slots_[slot].reset();
    --live_;
    while (!slots_.empty() && slots_.back() == nullptr) slots_.pop_back();
  }

  void Clear() {
    keys_.clear();
    slots_.clear();
    live_ = 0;
  }

  iterator begin() { return iterator(slots_.begin(), slots_.end()); }
  iterator end() { return iterator(slots_.end(), slots_.end()); }
  const_iterator begin() const {
    return const_iterator(slots_.begin(), slots_.end());
  }
  const_iterator end() const {
    return const_iterator(slots_.end(), slots_.end());
  }

 private:
  void CopyFrom(const BasicCollection& other) {
    slots_.reserve(other.live_);
    for (const auto& node : other.slots_) {
      if (node) Insert(live_, node->item, node->key);
    }
  }

  // Closes the gaps that removals by key left.
  void Compact() const {
    if (slots_.size() == live_) return;
    size_t to = 0;
    for (size_t from = 0; from < slots_.size(); ++from) {
      if (slots_[from] == nullptr) continue;
      slots_[to] = std::move(slots_[from]);
      slots_[to]->slot = to;
      ++to;
    }
    slots_.resize(to);
  }

  void Insert(size_t at, T item, std::optional<std::string> key) {
    if (key && keys_.count(std::string_view(*key))) throw Error(kDuplicateKey);
    auto node =
        std::make_unique<Node>(Node{std::move(item), std::move(key), 0});
    Node* raw = node.get();
    if (at == live_) {
      raw->slot = slots_.size();
      slots_.push_back(std::move(node));
    } else {
      Compact();
      slots_.insert(slots_.begin() + static_cast<std::ptrdiff_t>(at),
                    std::move(node));
      for (size_t i = at; i < slots_.size(); ++i) slots_[i]->slot = i;
    }
    ++live_;
    // The map's key views the node's own copy, which never moves.
    if (raw->key) keys_.emplace(std::string_view(*raw->key), raw);
  }

  Node& NodeOf(const CollectionIndex& index) const {
    if (index.IsKey()) {
      auto found = keys_.find(std::string_view(index.Key()));
      if (found == keys_.end()) throw Error(kInvalidProcedureCall);
      return *found->second;
    }
    return *slots_[PositionOf(index)];
  }

  // The 0-based position of an item in insertion order.
  size_t PositionOf(const CollectionIndex& index) const {
    if (index.IsKey()) {
      Compact();
      return NodeOf(index).slot;
    }
    int32_t position = index.Position();
    if (position < 1 || position > Count()) throw Error(kSubscriptOutOfRange);
    Compact();
    return static_cast<size_t>(position - 1);
  }

  mutable Slots slots_;
  size_t live_ = 0;
  std::unordered_map<std::string_view, Node*, KeyHash, KeyEqual> keys_;
};

}  // namespace automation

#endif  // KELQLN_AUTOMATION_BASIC_COLLECTION_H_
