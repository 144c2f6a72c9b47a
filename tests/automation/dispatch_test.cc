#include <gtest/gtest.h>

#include <string>

#include "automation/call.h"
#include "automation/error.h"
#include "tests/support/error_of.h"
#include "automation/member_table.h"

namespace automation {
namespace {

// A small class with one member of each kind, the way every class of the
// system declares its members.
class Counter : public DispatchImpl<Counter> {
 public:
  static const MemberTable<Counter>& Members() {
    static const MemberTable<Counter> table(
        "Counter",
        {
            {1, "Value", CallKind::kPropertyGet,
             [](Counter& self, Args&) { return Variant(self.value); }},
            {1, "Value", CallKind::kPropertyPut,
             [](Counter& self, Args& args) {
               self.value = CLng(PutValue(args));
               return Variant();
             }},
            {2, "AddTo", CallKind::kMethod,
             // Adds the value to the caller's variable: a by-reference argument.
             [](Counter& self, Args& args) {
               int32_t before = CLng(RequiredArg(args, 0));
               args[0] = Variant(before + self.value);
               return Variant(true);
             }},
            {3, "Step", CallKind::kMethod,
             [](Counter& self, Args& args) {
               self.value += CLng(OptionalArg(args, 0, int32_t{1}));
               return Variant(self.value);
             }},
            {kNamedOnly, "Reset", CallKind::kMethod,
             [](Counter& self, Args&) {
               self.value = 0;
               return Variant();
             }},
        });
    return table;
  }
  int32_t value = 0;
};

using testing_support::ErrorOf;

TEST(DispatchTest, MembersAnswerByNumberAndByNameIgnoringCase) {
  auto counter = std::make_shared<Counter>();
  Object object = counter;
  Let(object, 1, int32_t{5});
  EXPECT_EQ(CLng(Get(object, 1)), 5);
  LetByName(object, "VALUE", int32_t{6});
  EXPECT_EQ(CLng(GetByName(object, "value")), 6);
  EXPECT_EQ(CLng(CallByName(object, "step", int32_t{4})), 10);
  EXPECT_EQ(CLng(Call(object, 3)), 11);  // the optional argument left out
  EXPECT_EQ(CLng(Call(object, 3, Variant::Missing())), 12);
  CallByName(object, "Reset");
  EXPECT_EQ(counter->value, 0);
  EXPECT_GE(object->IdOfName("reset"), kFirstNamedDispId);
  EXPECT_EQ(object->TypeName(), "Counter");
  // Late binding lets a property be read with a method call.
  EXPECT_EQ(CLng(Call(object, 1)), 0);
}

TEST(DispatchTest, ByReferenceArgumentsAreWrittenBack) {
  auto counter = std::make_shared<Counter>();
  counter->value = 3;
  Args args{Variant(int32_t{4})};
  Variant result = Invoke(counter, 2, CallKind::kMethod, args);
  EXPECT_TRUE(CBool(result));
  EXPECT_EQ(CLng(args[0]), 7);
  Args by_name{Variant(int32_t{1})};
  InvokeByName(counter, "AddTo", CallKind::kMethod, by_name);
  EXPECT_EQ(CLng(by_name[0]), 4);
}

TEST(DispatchTest, FailuresCarryVbNumbers) {
  auto counter = std::make_shared<Counter>();
  Object nothing;
  EXPECT_EQ(ErrorOf([&] { Call(counter, 99); }), kNoSuchMember);
  EXPECT_EQ(ErrorOf([&] { CallByName(counter, "Missing"); }), kNoSuchMember);
  EXPECT_EQ(ErrorOf([&] { Let(counter, 2, int32_t{1}); }), kNoSuchMember);
  EXPECT_EQ(ErrorOf([&] { Call(nothing, 1); }), kObjectNotSet);
  EXPECT_EQ(ErrorOf([&] { CallByName(nothing, "Value"); }), kObjectNotSet);
  EXPECT_EQ(ErrorOf([&] { Call(counter, 2); }), kArgumentNotOptional);
  Error error(kNoSuchMember);
  EXPECT_EQ(error.Description(),
            "Object doesn't support this property or method");
  EXPECT_EQ(Error(kDuplicateKey).Description(),
            "This key is already associated with an element of this "
            "collection");
  EXPECT_EQ(Error(1234).Description(),
            "Application-defined or object-defined error");
}

TEST(DispatchTest, RequiredArgumentsMustBeGiven) {
  Args none;
  EXPECT_EQ(ErrorOf([&] { RequiredArg(none, 0); }), kArgumentNotOptional);
  Args missing{Variant::Missing()};
  EXPECT_EQ(ErrorOf([&] { RequiredArg(missing, 0); }), kArgumentNotOptional);
  EXPECT_EQ(CLng(OptionalArg(missing, 0, int32_t{9})), 9);
  EXPECT_EQ(ErrorOf([&] { PutValue(none); }), kWrongArgumentCount);
}

}  // namespace
}  // namespace automation
