#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "automation/basic_collection.h"
#include "automation/call.h"
#include "automation/collection.h"
#include "automation/dictionary.h"
#include "automation/error.h"
#include "tests/support/error_of.h"

namespace automation {
namespace {

using testing_support::ErrorOf;

std::string Listing(const BasicCollection<std::string>& c) {
  std::string text;
  for (const std::string& item : c) text += item;
  return text;
}

TEST(BasicCollectionTest, KeysMatchWithoutCaseAndAreUnique) {
  BasicCollection<std::string> c;
  c.Add("a", "Alpha");
  c.Add("b", "BETA");
  c.Add("c");
  EXPECT_EQ(c.Count(), 3);
  EXPECT_EQ(c.Item("alpha"), "a");
  EXPECT_EQ(c.Item("beta"), "b");
  EXPECT_EQ(c.Item(3), "c");
  EXPECT_TRUE(c.Contains("ALPHA"));
  EXPECT_EQ(c.Find("gamma"), nullptr);
  EXPECT_EQ(ErrorOf([&] { c.Add("x", "aLpHa"); }), kDuplicateKey);
  EXPECT_EQ(c.Count(), 3);  // the failed add added nothing
  EXPECT_EQ(ErrorOf([&] { c.Item("gamma"); }), kInvalidProcedureCall);
  EXPECT_EQ(ErrorOf([&] { c.Item(0); }), kSubscriptOutOfRange);
  EXPECT_EQ(ErrorOf([&] { c.Item(4); }), kSubscriptOutOfRange);
  EXPECT_EQ(ErrorOf([&] { c.Remove("gamma"); }), kInvalidProcedureCall);
  EXPECT_EQ(ErrorOf([&] { c.Remove(-1); }), kSubscriptOutOfRange);
  c.Remove("Beta");
  EXPECT_EQ(Listing(c), "ac");
  c.Add("b2", "beta");  // the key is free again
  EXPECT_EQ(c.Item("BETA"), "b2");
}

TEST(BasicCollectionTest, BeforeAndAfterPlaceItemsByPositionOrKey) {
  struct Case {
    std::optional<CollectionIndex> before, after;
    std::string expected;
  };
  const std::vector<Case> cases = {
      {CollectionIndex(1), std::nullopt, "XabC"},
      {CollectionIndex(3), std::nullopt, "abXC"},
      {std::nullopt, CollectionIndex(3), "abCX"},
      {std::nullopt, CollectionIndex(1), "aXbC"},
      {CollectionIndex("kc"), std::nullopt, "abXC"},
      {std::nullopt, CollectionIndex("KA"), "aXbC"},
  };
  for (const Case& c : cases) {
    BasicCollection<std::string> items;
    items.Add("a", "ka");
    items.Add("b");
    items.Add("C", "kc");
    items.Add("X", "kx", c.before, c.after);
    EXPECT_EQ(Listing(items), c.expected);
    EXPECT_EQ(items.Item("kx"), "X");
  }
  BasicCollection<std::string> items;
  items.Add("a");
  EXPECT_EQ(ErrorOf([&] { items.Add("x", {}, CollectionIndex(1),
                                    CollectionIndex(1)); }),
            kInvalidProcedureCall);
  EXPECT_EQ(ErrorOf([&] { items.Add("x", {}, CollectionIndex(2)); }),
            kSubscriptOutOfRange);
  EXPECT_EQ(ErrorOf([&] { items.Add("x", {}, CollectionIndex("no")); }),
            kInvalidProcedureCall);
  EXPECT_EQ(Listing(items), "a");
}

TEST(BasicCollectionTest, RemovingDuringAWalkByPosition) {
  // The VB idiom: walk by position, remove matches and stay on the same
  // position, so every item is seen exactly once.
  BasicCollection<int> c;
  for (int i = 1; i <= 10; ++i) c.Add(i, "k" + std::to_string(i));
  int32_t i = 1;
  std::vector<int> seen;
  while (i <= c.Count()) {
    seen.push_back(c.Item(i));
    if (c.Item(i) % 2 == 0 || c.Item(i) == 5) {
      c.Remove(i);
    } else {
      ++i;
    }
  }
  EXPECT_EQ(seen.size(), 10u);
  EXPECT_EQ(std::vector<int>(c.begin(), c.end()),
            (std::vector<int>{1, 3, 7, 9}));
  EXPECT_FALSE(c.Contains("k4"));
  EXPECT_EQ(c.Item("k7"), 7);
  // Copies are independent, keys included.
  BasicCollection<int> copy = c;
  copy.Remove("k1");
  EXPECT_EQ(copy.Count(), 3);
  EXPECT_EQ(c.Item("K1"), 1);
}

TEST(CollectionTest, LateBoundMembersFollowVbCollection) {
  auto c = Collection::Create();
  Object object = c;
  CallByName(object, "Add", "first", "k1");
  CallByName(object, "Add", "second");
  CallByName(object, "Add", "zero", Variant::Missing(), int32_t{1});
  EXPECT_EQ(CLng(GetByName(object, "Count")), 3);
  EXPECT_EQ(CStr(Call(object, Collection::kItem, int32_t{1})), "zero");
  EXPECT_EQ(CStr(Get(object, kDispIdValue, "K1")), "first");
  EXPECT_EQ(ErrorOf([&] { CallByName(object, "Add", "x", int32_t{5}); }),
            kTypeMismatch);
  EXPECT_EQ(ErrorOf([&] { CallByName(object, "Add", "x", "k1"); }),
            kDuplicateKey);
  CallByName(object, "Remove", "k1");
  EXPECT_EQ(ErrorOf([&] { CallByName(object, "Item", int32_t{3}); }),
            kSubscriptOutOfRange);
  std::vector<Variant> items = CollectionItems(object);
  ASSERT_EQ(items.size(), 2u);
  EXPECT_EQ(CStr(items[1]), "second");
  EXPECT_EQ(object->TypeName(), "Collection");
}

TEST(DictionaryTest, KeysAreExactAndItemsKeepTheirOrder) {
  auto d = Dictionary::Create();
  Object object = d;
  CallByName(object, "Add", "b", int32_t{2});
  CallByName(object, "Add", "B", int32_t{3});  // another key: case counts
  CallByName(object, "Add", int32_t{1}, "one");
  CallByName(object, "Add", "1", "text one");  // a text is not a number
  EXPECT_EQ(CLng(GetByName(object, "Count")), 4);
  EXPECT_TRUE(CBool(CallByName(object, "Exists", "B")));
  EXPECT_FALSE(CBool(CallByName(object, "Exists", "c")));
  EXPECT_EQ(ErrorOf([&] { CallByName(object, "Add", "b", int32_t{9}); }),
            kDuplicateKey);
  EXPECT_EQ(CStr(Get(object, Dictionary::kItem, int32_t{1})), "one");
  EXPECT_TRUE(Get(object, Dictionary::kItem, "none").IsEmpty());
  EXPECT_EQ(CLng(GetByName(object, "Count")), 4);
  std::vector<Variant> items = CollectionItems(CObj(CallByName(object, "Items")));
  std::vector<Variant> keys = CollectionItems(CObj(CallByName(object, "Keys")));
  ASSERT_EQ(items.size(), 4u);
  EXPECT_EQ(CLng(items[1]), 3);
  EXPECT_EQ(CStr(keys[3]), "1");
  CallByName(object, "Remove", "b");
  EXPECT_EQ(d->Count(), 3);
  EXPECT_EQ(ErrorOf([&] { CallByName(object, "Remove", "zz"); }),
            Dictionary::kElementNotFound);
  EXPECT_EQ(object->TypeName(), "Dictionary");
}

}  // namespace
}  // namespace automation
