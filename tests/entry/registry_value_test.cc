#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "automation/variant.h"
#include "entry/add_in_services.h"
#include "platform/registry.h"
#include "platform/registry_store.h"

namespace kelqln {
namespace {

using automation::Variant;
using automation::VarType;

constexpr char kKey[] = "SOFTWARE\\Quenta Software\\Orel\\AddIns\\Rose";

class ReadRegistryValueTest : public ::testing::Test {
 protected:
  void TearDown() override {
    platform::UseRegistryStore(platform::RegistryStore());
  }
};

TEST_F(ReadRegistryValueTest, StringsNumbersAndOtherTypes) {
  const platform::HKEY hklm = platform::kHkeyLocalMachine;
  platform::RegistryStore store;
  store.SetString(hklm, kKey, "One", "x");
  store.SetString(hklm, kKey, "Text", "C:\\Program Files\\Orel \xC3\xA9");
  store.SetString(hklm, kKey, "Empty", "");
  store.Set(hklm, kKey, "JustZero", platform::kRegSz, {0});
  store.Set(hklm, kKey, "NoBytes", platform::kRegSz, {});
  store.SetDword(hklm, kKey, "Number", 10);
  store.SetDword(hklm, kKey, "AllBits", 0xffffffffu);
  store.Set(hklm, kKey, "Bytes", platform::kRegBinary, {'a', 'b', 0});
  store.Set(hklm, kKey, "Expandable", platform::kRegExpandSz, {'a', 0});
  store.SetString(platform::kHkeyCurrentUser, kKey, "UserOnly", "u");
  platform::UseRegistryStore(std::move(store));

  struct Case {
    std::string key;
    std::string value;
    VarType type;
    std::string text;  // CStr of the result
  };
  const Case cases[] = {
      {kKey, "One", VarType::kString, "x"},
      {kKey, "Text", VarType::kString, "C:\\Program Files\\Orel \xC3\xA9"},
      {kKey, "Empty", VarType::kString, ""},
      {kKey, "JustZero", VarType::kString, ""},
      {kKey, "NoBytes", VarType::kString, ""},
      {kKey, "Number", VarType::kLong, "10"},
      {kKey, "AllBits", VarType::kLong, "-1"},
      {kKey, "Bytes", VarType::kEmpty, ""},
      {kKey, "Expandable", VarType::kEmpty, ""},
      {kKey, "Missing", VarType::kEmpty, ""},
      {kKey, "UserOnly", VarType::kEmpty, ""},
      {"SOFTWARE\\quenta software\\OREL\\addins\\rose", "one", VarType::kString,
       "x"},
      {"SOFTWARE\\Nowhere", "One", VarType::kEmpty, ""},
  };
  for (const Case& c : cases) {
    Variant value = ReadRegistryValue(hklm, c.key, c.value);
    EXPECT_EQ(value.Type(), c.type) << c.value;
    EXPECT_EQ(automation::CStr(value), c.text) << c.value;
  }
}

}  // namespace
}  // namespace kelqln
