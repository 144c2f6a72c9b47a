#include "automation/variant.h"

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <string>
#include <vector>

#include "automation/collection.h"
#include "automation/error.h"
#include "tests/support/error_of.h"

namespace automation {
namespace {

using testing_support::ErrorOf;

TEST(VariantTest, BooleanIsSixteenBitsAllSet) {
  Variant yes(true);
  EXPECT_EQ(yes.Type(), VarType::kBoolean);
  EXPECT_EQ(CInt(yes), -1);
  EXPECT_EQ(CLng(yes), -1);
  EXPECT_EQ(CInt(Variant(false)), 0);
  EXPECT_EQ(CStr(yes), "True");
  EXPECT_EQ(CStr(Variant(false)), "False");
  EXPECT_TRUE(CBool(Variant(int16_t{-1})));
  EXPECT_TRUE(CBool(Variant(int16_t{2})));
  EXPECT_FALSE(CBool(Variant(0.0)));
}

TEST(VariantTest, IntegerConversionsRoundHalfToEvenAndCheckRange) {
  struct Case {
    double input;
    int expected;  // 0 with overflow set means error 6
    bool overflow;
  };
  const std::vector<Case> cases = {
      {0.5, 0, false},         {1.5, 2, false},      {2.5, 2, false},
      {3.5, 4, false},         {-0.5, 0, false},     {-1.5, -2, false},
      {-2.5, -2, false},       {2.4999, 2, false},   {32767.0, 32767, false},
      {32767.4, 32767, false}, {32767.5, 0, true},   {32768.0, 0, true},
      {-32768.0, -32768, false}, {-32768.5, -32768, false},
      {-32769.0, 0, true},     {NAN, 0, true},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.input);
    if (c.overflow) {
      EXPECT_EQ(ErrorOf([&] { CInt(Variant(c.input)); }), kOverflow);
    } else {
      EXPECT_EQ(CInt(Variant(c.input)), c.expected);
    }
  }
  EXPECT_EQ(ErrorOf([] { CInt(Variant(int32_t{32768})); }), kOverflow);
  EXPECT_EQ(CLng(Variant(2147483646.5)), 2147483646);
  EXPECT_EQ(ErrorOf([] { CLng(Variant(2147483647.5)); }), kOverflow);
  EXPECT_EQ(CLng(Variant(int16_t{-7})), -7);
}

TEST(VariantTest, TextConvertsToNumbersAsVbReadsThem) {
  EXPECT_EQ(CInt(Variant("  12 ")), 12);
  EXPECT_EQ(CInt(Variant("2.5")), 2);
  EXPECT_EQ(CLng(Variant("-1e3")), -1000);
  EXPECT_EQ(CInt(Variant("&HFFFF")), -1);
  EXPECT_EQ(CLng(Variant("&H10")), 16);
  EXPECT_EQ(CLng(Variant("&HFFFFFFFF")), -1);
  EXPECT_EQ(ErrorOf([] { CInt(Variant("abc")); }), kTypeMismatch);
  EXPECT_EQ(ErrorOf([] { CInt(Variant("")); }), kTypeMismatch);
  EXPECT_EQ(ErrorOf([] { CInt(Variant("12abc")); }), kTypeMismatch);
  EXPECT_EQ(ErrorOf([] { CInt(Variant("40000")); }), kOverflow);
  EXPECT_TRUE(CBool(Variant("TRUE")));
  EXPECT_FALSE(CBool(Variant("false")));
  EXPECT_FALSE(CBool(Variant("0")));
  EXPECT_TRUE(CBool(Variant("-1")));
  EXPECT_EQ(ErrorOf([] { CBool(Variant("yes")); }), kTypeMismatch);
  EXPECT_FLOAT_EQ(CSng(Variant("0.25")), 0.25f);
  EXPECT_EQ(ErrorOf([] { CSng(Variant(1e300)); }), kOverflow);
}

TEST(VariantTest, TextFormsOfNumbers) {
  struct Case {
    Variant input;
    std::string expected;
  };
  const std::vector<Case> cases = {
      {Variant(12.5f), "12.5"},
      {Variant(8475.0f), "8475"},
      {Variant(0.1f), "0.1"},
      {Variant(1234567.0f), "1234567"},
      {Variant(10000000.0f), "1E+07"},
      {Variant(1.0f / 3.0f), "0.3333333"},
      {Variant(-0.0f), "0"},
      {Variant(0.00001f), "1E-05"},
      {Variant(0.1), "0.1"},
      {Variant(1.0 / 3.0), "0.333333333333333"},
      {Variant(int16_t{-32768}), "-32768"},
      {Variant(int32_t{123456789}), "123456789"},
      {Variant(), ""},
      {Variant("text"), "text"},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(CStr(c.input), c.expected) << c.input.TypeName();
  }
}

TEST(VariantTest, EmptyNullMissingAndObjects) {
  EXPECT_EQ(CInt(Variant()), 0);
  EXPECT_FALSE(CBool(Variant()));
  EXPECT_EQ(ErrorOf([] { CStr(Variant::Null()); }), kInvalidUseOfNull);
  EXPECT_EQ(ErrorOf([] { CInt(Variant::Null()); }), kInvalidUseOfNull);
  EXPECT_EQ(ErrorOf([] { CStr(Variant::Missing()); }), kTypeMismatch);
  EXPECT_EQ(ErrorOf([] { CObj(Variant("x")); }), kObjectRequired);
  EXPECT_EQ(ErrorOf([] { CObj(Variant()); }), kObjectRequired);
  EXPECT_EQ(CObj(Variant(nullptr)), nullptr);
  EXPECT_TRUE(Variant(nullptr).IsNothing());
  EXPECT_EQ(Variant(nullptr).TypeName(), "Nothing");
  EXPECT_EQ(Variant::Missing().TypeName(), "Error");

  // An object in an expression stands for its default member.
  auto collection = Collection::Create();
  EXPECT_EQ(Variant(collection).TypeName(), "Collection");
  EXPECT_EQ(ErrorOf([&] { CStr(Variant(collection)); }), kArgumentNotOptional);
  EXPECT_EQ(ErrorOf([] { CStr(Variant(Object())); }), kObjectNotSet);
}

}  // namespace
}  // namespace automation
