#include <gtest/gtest.h>

#include <functional>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/error.h"
#include "tests/support/error_of.h"
#include "automation/server_module.h"

namespace automation {
namespace {

using testing_support::ErrorOf;

TEST(ClassRegistryTest, CreatesByEitherNameIgnoringCase) {
  int created = 0;
  RegisterClass("kelTest.Local", "{11111111-2222-3333-4444-555555555555}",
                [&created] {
                  ++created;
                  return Object();
                });
  EXPECT_TRUE(IsClassRegistered("KELTEST.LOCAL"));
  CreateObject("keltest.local");
  CreateObject("{11111111-2222-3333-4444-555555555555}");
  EXPECT_EQ(created, 2);
  EXPECT_TRUE(UnregisterClass("kelTest.Local"));
  EXPECT_FALSE(IsClassRegistered("{11111111-2222-3333-4444-555555555555}"));
  EXPECT_FALSE(UnregisterClass("kelTest.Local"));
  EXPECT_EQ(ErrorOf([] { CreateObject("kelTest.Local"); }),
            kCannotCreateObject);
}

TEST(ServerLibraryTest, LoadsRegistersHandsOutFactoriesAndCountsObjects) {
  ServerLibrary library = ServerLibrary::Load(KELQLN_TEST_SERVER_PATH);
  ASSERT_TRUE(IsClassRegistered("kelTest.Greeter"));
  EXPECT_EQ(library.CanUnloadNow(), kSOk);
  {
    Object greeter = CreateObject("kelTest.Greeter");
    EXPECT_EQ(CStr(CallByName(greeter, "Greet", "world")), "Hello, world");
    EXPECT_EQ(library.CanUnloadNow(), kSFalse);
    const ClassFactory* factory =
        library.GetClassObject("{0d7f0001-0000-4000-8000-00000000c0de}");
    ASSERT_NE(factory, nullptr);
    Object second = factory->CreateInstance();
    EXPECT_EQ(CStr(Call(second, 1, "again")), "Hello, again");
  }
  EXPECT_EQ(library.CanUnloadNow(), kSOk);
  EXPECT_EQ(library.GetClassObject("{no-such-class}"), nullptr);
  EXPECT_EQ(library.Unregister(), kSOk);
  EXPECT_FALSE(IsClassRegistered("kelTest.Greeter"));
  EXPECT_EQ(library.Register(), kSOk);
  EXPECT_TRUE(IsClassRegistered("kelTest.Greeter"));
}

TEST(ServerLibraryTest, ALibraryThatCannotBeLoadedSaysWhy) {
  try {
    ServerLibrary::Load("/nonexistent/libnothing.so");
    FAIL() << "loaded a missing library";
  } catch (const Error& error) {
    EXPECT_EQ(error.Number(), kErrorLoadingDll);
    EXPECT_NE(error.Description().find("/nonexistent/libnothing.so"),
              std::string::npos);
  }
}

}  // namespace
}  // namespace automation
