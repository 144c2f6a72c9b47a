#include "platform/registry.h"

#include <gtest/gtest.h>
#include <stdlib.h>

#include <filesystem>
#include <fstream>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "automation/error.h"
#include "platform/registry_store.h"

namespace platform {
namespace {

constexpr char kApp[] = "SOFTWARE\\Vendor\\App";

class RegistryTest : public testing::Test {
 protected:
  void SetUp() override {
    RegistryStore store;
    store.SetString(kHkeyLocalMachine, kApp, "One", "x");
    store.SetString(kHkeyLocalMachine, kApp, "Empty", "");
    store.SetString(kHkeyLocalMachine, kApp, "", "default");
    store.SetDword(kHkeyLocalMachine, kApp, "Debug", 0x01000020);
    store.Set(kHkeyLocalMachine, kApp, "Blob", kRegBinary, {9, 8, 7});
    store.AddKey(kHkeyLocalMachine, "SOFTWARE\\Vendor\\App\\AddIns");
    store.SetString(kHkeyCurrentUser, "SOFTWARE\\Mine", "One", "user");
    UseRegistryStore(std::move(store));
  }

  // Opens a key that the test closes at its end.
  int32_t Open(HKEY root, std::string_view key, HKEY* opened,
               uint32_t access = kKeyRead) {
    *opened = kHkeyCurrentUser;
    int32_t result = RegOpenKeyEx(root, key, 0, access, opened);
    if (result == kErrorSuccess) {
      opened_.push_back(*opened);
    } else {
      EXPECT_EQ(*opened, nullptr);
    }
    return result;
  }

  void TearDown() override {
    for (HKEY key : opened_) EXPECT_EQ(RegCloseKey(key), kErrorSuccess);
  }

  std::vector<HKEY> opened_;
};

TEST_F(RegistryTest, OpensKeysThatExist) {
  int not_a_key = 0;
  struct Case {
    HKEY root;
    std::string key;
    uint32_t access;
    int32_t result;
  };
  const std::vector<Case> cases = {
      {kHkeyLocalMachine, "software\\VENDOR\\app", kKeyRead, kErrorSuccess},
      {kHkeyLocalMachine, "SOFTWARE\\Vendor", 0x20009, kErrorSuccess},
      {kHkeyLocalMachine, "", kKeyQueryValue, kErrorSuccess},
      {kHkeyLocalMachine, "SOFTWARE\\Vendor\\App\\AddIns", kKeyRead,
       kErrorSuccess},
      {kHkeyLocalMachine, "SOFTWARE\\Vendor\\App\\Nope", kKeyRead,
       kErrorFileNotFound},
      {kHkeyLocalMachine, "SOFTWARE\\Vend", kKeyRead, kErrorFileNotFound},
      {kHkeyLocalMachine, "SOFTWARE\\Mine", kKeyRead, kErrorFileNotFound},
      {kHkeyCurrentUser, "SOFTWARE\\Mine", kKeyRead, kErrorSuccess},
      {kHkeyLocalMachine, kApp, 0x20006, kErrorAccessDenied},
      {reinterpret_cast<HKEY>(&not_a_key), kApp, kKeyRead, kErrorInvalidHandle},
  };
  for (const Case& test : cases) {
    HKEY key;
    EXPECT_EQ(Open(test.root, test.key, &key, test.access), test.result)
        << test.key;
  }
  HKEY software, app;
  ASSERT_EQ(Open(kHkeyLocalMachine, "Software", &software), kErrorSuccess);
  EXPECT_EQ(Open(software, "Vendor\\App", &app), kErrorSuccess);
  EXPECT_EQ(Open(software, "App", &app), kErrorFileNotFound);
}

TEST_F(RegistryTest, ReportsTypesAndSizes) {
  struct Case {
    std::string name;
    uint32_t type;
    std::vector<uint8_t> data;
  };
  const std::vector<Case> cases = {
      {"one", kRegSz, {'x', 0}},
      {"Empty", kRegSz, {0}},
      {"", kRegSz, {'d', 'e', 'f', 'a', 'u', 'l', 't', 0}},
      {"Debug", kRegDword, {0x20, 0x00, 0x00, 0x01}},
      {"BLOB", kRegBinary, {9, 8, 7}},
  };
  HKEY key;
  ASSERT_EQ(Open(kHkeyLocalMachine, kApp, &key), kErrorSuccess);
  for (const Case& test : cases) {
    SCOPED_TRACE(test.name);
    uint32_t type = 99, size = 0;
    ASSERT_EQ(RegQueryValueEx(key, test.name, &type, nullptr, &size),
              kErrorSuccess);
    EXPECT_EQ(type, test.type);
    EXPECT_EQ(size, test.data.size());

    std::vector<uint8_t> data(size);
    ASSERT_EQ(RegQueryValueEx(key, test.name, nullptr, data.data(), &size),
              kErrorSuccess);
    EXPECT_EQ(data, test.data);

    size = static_cast<uint32_t>(test.data.size() - 1);
    EXPECT_EQ(RegQueryValueEx(key, test.name, &type, data.data(), &size),
              kErrorMoreData);
    EXPECT_EQ(size, test.data.size());
  }
}

TEST_F(RegistryTest, MissingValuesAndBadHandles) {
  HKEY key;
  ASSERT_EQ(Open(kHkeyLocalMachine, kApp, &key), kErrorSuccess);
  uint32_t size = 4;
  uint8_t data[4];
  EXPECT_EQ(RegQueryValueEx(key, "Nope", nullptr, data, &size),
            kErrorFileNotFound);
  EXPECT_EQ(RegQueryValueEx(key, "One", nullptr, data, nullptr),
            kErrorInvalidParameter);
  EXPECT_EQ(RegQueryValueEx(kHkeyLocalMachine, "One", nullptr, nullptr, &size),
            kErrorFileNotFound);

  // A key stays valid across a change of store and reads the new one.
  RegistryStore other;
  other.SetString(kHkeyLocalMachine, kApp, "One", "changed");
  UseRegistryStore(std::move(other));
  EXPECT_EQ(RegQueryValueEx(key, "One", nullptr, nullptr, &size),
            kErrorSuccess);
  EXPECT_EQ(size, 8u);

  HKEY closed = nullptr;
  ASSERT_EQ(RegOpenKeyEx(kHkeyLocalMachine, kApp, 0, kKeyRead, &closed),
            kErrorSuccess);
  EXPECT_EQ(RegCloseKey(closed), kErrorSuccess);
  EXPECT_EQ(RegCloseKey(closed), kErrorInvalidHandle);
  EXPECT_EQ(RegQueryValueEx(closed, "One", nullptr, nullptr, &size),
            kErrorInvalidHandle);
  EXPECT_EQ(RegCloseKey(kHkeyLocalMachine), kErrorSuccess);
}

// Sets environment variables (null clears one) for one scope.
class ScopedEnvironment {
 public:
  void Set(const char* name, const char* value) {
    const char* old = getenv(name);
    saved_.try_emplace(name,
                       old ? std::optional<std::string>(old) : std::nullopt);
    value ? setenv(name, value, 1) : unsetenv(name);
  }
  ~ScopedEnvironment() {
    for (const auto& [name, value] : saved_) {
      value ? setenv(name.c_str(), value->c_str(), 1) : unsetenv(name.c_str());
    }
  }

 private:
  std::map<std::string, std::optional<std::string>> saved_;
};

TEST(RegistryFileTest, FindsTheFileFromTheEnvironment) {
  struct Case {
    const char* registry;
    const char* config;
    const char* home;
    std::string path;
  };
  const std::vector<Case> cases = {
      {"/r/x.reg", "/xdg", "/home/u", "/r/x.reg"},
      {"", "/xdg", "/home/u", "/xdg/kelqln/registry.reg"},
      {nullptr, "/xdg", nullptr, "/xdg/kelqln/registry.reg"},
      {nullptr, "", "/home/u", "/home/u/.config/kelqln/registry.reg"},
      {nullptr, "relative", "/home/u", "/home/u/.config/kelqln/registry.reg"},
  };
  for (const Case& test : cases) {
    ScopedEnvironment environment;
    environment.Set("KELQLN_REGISTRY", test.registry);
    environment.Set("XDG_CONFIG_HOME", test.config);
    environment.Set("HOME", test.home);
    EXPECT_EQ(RegistryFilePath(), test.path);
  }
}

std::string WriteFile(const std::string& name, const std::string& text) {
  const auto path = std::filesystem::path(testing::TempDir()) / name;
  std::ofstream(path) << "Windows Registry Editor Version 5.00\n" << text;
  return path.string();
}

TEST(RegistryFileTest, LoadsTheFileAndKeepsItsError) {
  const std::string good = WriteFile("good.reg", "[HKLM\\A]\n\"S\"=\"v\"\n");
  const std::string bad = WriteFile("bad.reg", "[HKLM\\A]\nS=v\n");
  ScopedEnvironment environment;
  environment.Set("KELQLN_REGISTRY", good.c_str());
  HKEY key = nullptr;

  LoadRegistry();
  EXPECT_EQ(RegistryLoadError(), "");
  ASSERT_EQ(RegOpenKeyEx(kHkeyLocalMachine, "A", 0, kKeyRead, &key),
            kErrorSuccess);
  EXPECT_EQ(RegCloseKey(key), kErrorSuccess);

  EXPECT_THROW(UseRegistryFile(bad), automation::Error);
  EXPECT_EQ(RegistryLoadError().rfind(bad + ":3: ", 0), 0u);
  EXPECT_EQ(RegOpenKeyEx(kHkeyLocalMachine, "", 0, kKeyRead, &key),
            kErrorBadDb);
  try {
    UseRegistryFile(testing::TempDir());
    ADD_FAILURE() << "a directory loaded";
  } catch (const automation::Error& error) {
    EXPECT_EQ(error.Number(), automation::kPathFileAccessError);
  }

  environment.Set("KELQLN_REGISTRY", (good + ".missing").c_str());
  LoadRegistry();
  EXPECT_EQ(RegistryLoadError(), "");
  EXPECT_EQ(RegOpenKeyEx(kHkeyLocalMachine, "A", 0, kKeyRead, &key),
            kErrorFileNotFound);
}

// Without a load the first open reads the file; each check runs in a fresh
// process, where nothing was loaded before.
TEST(RegistryFileDeathTest, FirstOpenLoadsTheFile) {
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  const std::string good = WriteFile("lazy.reg", "[HKLM\\A]\n");
  const std::string bad = WriteFile("lazy_bad.reg", "\n[HKXX\\A]\n");
  auto open_and_exit = [](const std::string& path) {
    setenv("KELQLN_REGISTRY", path.c_str(), 1);
    HKEY key = nullptr;
    int32_t result = RegOpenKeyEx(kHkeyLocalMachine, "A", 0, kKeyRead, &key);
    fprintf(stderr, "[%s]", RegistryLoadError().c_str());
    _Exit(result);
  };
  EXPECT_EXIT(open_and_exit(good), testing::ExitedWithCode(kErrorSuccess),
              "\\[\\]");
  EXPECT_EXIT(open_and_exit(bad), testing::ExitedWithCode(kErrorBadDb & 0xff),
              "lazy_bad.reg:3: unknown root");
}

}  // namespace
}  // namespace platform
