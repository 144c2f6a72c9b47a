#include "entry/debug_log.h"

#include <gtest/gtest.h>
#include <stdlib.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <optional>
#include <sstream>
#include <string>
#include <vector>

#include "platform/clock.h"
#include "platform/manual_clock.h"
#include "platform/registry.h"
#include "platform/registry_store.h"

namespace kelqln {
namespace {

namespace fs = std::filesystem;

constexpr char kKey[] = "SOFTWARE\\Quenta Software\\Orel\\AddIns\\VisualStudio";

constexpr uint32_t Category(int c) { return 1u << c; }
constexpr uint32_t Level(int l) { return 1u << (24 + l); }

struct Settings {
  std::optional<uint32_t> mask = std::nullopt;
  std::optional<std::string> output_file = std::nullopt;
  std::optional<std::string> install_dir = std::nullopt;
  std::optional<std::string> suppress = std::nullopt;
};

class DebugLogTest : public ::testing::Test {
 protected:
  void SetUp() override {
    dir_ =
        fs::path(::testing::TempDir()) /
        ("kelqln_debug_log_" +
         std::string(
             ::testing::UnitTest::GetInstance()->current_test_info()->name()));
    fs::remove_all(dir_);
    fs::create_directories(dir_);
    log_ = (dir_ / "trace.log").string();
    clock_ = std::make_shared<platform::ManualClock>();
    clock_->SetDateTimeText("2024-05-06 07:08:09");
    clock_->SetSecondsSinceMidnight(25689.5f);
    platform::SetClock(clock_);
    ResetDebugSettings();
  }

  void TearDown() override {
    ResetDebugSettings();
    platform::UseRegistryStore(platform::RegistryStore());
    platform::SetClock(nullptr);
    fs::remove_all(dir_);
  }

  // Writes the settings into a fresh registry and has them read again.
  void Use(const Settings& settings) {
    platform::RegistryStore store;
    const platform::HKEY hklm = platform::kHkeyLocalMachine;
    if (settings.mask) store.SetDword(hklm, kKey, "Debug", *settings.mask);
    if (settings.output_file) {
      store.SetString(hklm, kKey, "DebugOutputFile", *settings.output_file);
    }
    if (settings.install_dir) {
      store.SetString(hklm, kKey, "InstallDir", *settings.install_dir);
    }
    if (settings.suppress) {
      store.SetString(hklm, kKey, "SuppressTimeStamps", *settings.suppress);
    }
    platform::UseRegistryStore(std::move(store));
    ResetDebugSettings();
  }

  void UseMask(uint32_t mask, std::string suppress = "") {
    Use({.mask = mask, .output_file = log_, .suppress = suppress});
  }

  static std::string Read(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    std::stringstream text;
    text << in.rdbuf();
    return text.str();
  }

  fs::path dir_;
  std::string log_;
  std::shared_ptr<platform::ManualClock> clock_;
};

TEST_F(DebugLogTest, MaskNeedsBothTheCategoryAndTheLevelBit) {
  struct Case {
    const char* name;
    uint32_t mask;
    int32_t category;
    int32_t level;
    bool writes;
  };
  const uint32_t all = 0x7fff | (0x7fu << 24);
  const Case cases[] = {
      {"mask 0", 0, 5, 4, false},
      {"category and level", Category(5) | Level(4), 5, 4, true},
      {"other level", Category(5) | Level(4), 5, 3, false},
      {"other category", Category(5) | Level(4), 4, 4, false},
      {"category only", Category(5), 5, 4, false},
      {"level only", Level(4), 5, 4, false},
      {"highest category and lowest level", Category(14) | Level(0), 14, 0,
       true},
      {"category 0 never writes", all, 0, 4, false},
      {"category 20 is tested as 0", all, 20, 4, false},
      {"negative category is tested as 0", all, -1, 4, false},
      {"category 15 has no bit", Category(15) | Level(4), 15, 4, false},
      {"level 9 is tested as 6", Category(5) | Level(6), 5, 9, true},
      {"negative level is tested as 6", Category(5) | Level(6), 5, -1, true},
      {"level 9 without bit 30", Category(5) | Level(4), 5, 9, false},
      {"every bit of the number", 0xffffffffu, 5, 4, true},
  };
  for (const Case& c : cases) {
    UseMask(c.mask);
    fs::remove(log_);
    EXPECT_EQ(ShouldLog(c.category, c.level), c.writes) << c.name;
    EXPECT_EQ(DebugLog("message", c.category, c.level), c.writes) << c.name;
    EXPECT_EQ(fs::exists(log_), c.writes) << c.name;
  }
}

TEST_F(DebugLogTest, LinesAreStampedPaddedAndAppended) {
  UseMask(Category(5) | Category(8) | Level(4) | Level(6));
  EXPECT_TRUE(DebugLog("Synchronising Core", 5, 4));
  clock_->SetDateTimeText("2024-05-06 07:08:10");
  clock_->SetSecondsSinceMidnight(25690.25f);
  EXPECT_TRUE(DebugLog("Start", 8, 6));
  EXPECT_TRUE(DebugLog("odd level", 5, 12345));
  EXPECT_EQ(
      Read(log_),
      "2024-05-06 07:08:09 (25689.5)  TRACE    QLN       Synchronising "
      "Core\r\n"
      "2024-05-06 07:08:10 (25690.25)  DEBUG    APPSTART  Start\r\n"
      "2024-05-06 07:08:10 (25690.25)  12345LEVEL QLN       odd level\r\n");
}

TEST_F(DebugLogTest, TimeStampsAreLeftOutOnlyForTrueInAnyCase) {
  struct Case {
    std::string value;
    bool stamped;
  };
  const Case cases[] = {{"true", false}, {"TRUE", false}, {"True", false},
                        {"", true},      {"yes", true},   {"1", true},
                        {" true", true}};
  for (const Case& c : cases) {
    UseMask(Category(5) | Level(3), c.value);
    fs::remove(log_);
    DebugLog("text", 5, 3);
    std::string expected = " INFO     QLN       text\r\n";
    if (c.stamped) expected = "2024-05-06 07:08:09 (25689.5) " + expected;
    EXPECT_EQ(Read(log_), expected) << "'" << c.value << "'";
  }
}

TEST_F(DebugLogTest, LogFileFallsBackToTheInstallDirectoryThenTheTemporary) {
  const char* saved = getenv("TMPDIR");
  std::optional<std::string> saved_tmp;
  if (saved != nullptr) saved_tmp = saved;
  const fs::path temp = dir_ / "tmp";
  const fs::path install = dir_ / "install";
  fs::create_directories(temp);
  fs::create_directories(install);
  setenv("TMPDIR", temp.c_str(), 1);

  struct Case {
    const char* name;
    Settings settings;
    fs::path expected;
  };
  const uint32_t mask = Category(5) | Level(1);
  const Case cases[] = {
      {"output file wins",
       {.mask = mask, .output_file = log_, .install_dir = install.string()},
       log_},
      {"inside the install directory",
       {.mask = mask, .output_file = "", .install_dir = install.string()},
       install / "keldebuglog.txt"},
      {"install directory with a trailing slash",
       {.mask = mask, .install_dir = install.string() + "/"},
       install / "keldebuglog.txt"},
      {"temporary directory", {.mask = mask}, temp / "keldebuglog.txt"},
  };
  for (const Case& c : cases) {
    Use(c.settings);
    EXPECT_TRUE(DebugLog(c.name, 5, 1));
    EXPECT_NE(Read(c.expected.string()).find(c.name), std::string::npos)
        << c.name;
    fs::remove(c.expected);
  }

  if (saved_tmp) {
    setenv("TMPDIR", saved_tmp->c_str(), 1);
  } else {
    unsetenv("TMPDIR");
  }
}

TEST_F(DebugLogTest, UnwritableFileIsTriedFiveTimesThenDropped) {
  // A directory cannot be opened for appending.
  Use({.mask = Category(5) | Level(1), .output_file = dir_.string()});
  EXPECT_TRUE(DebugLog("lost", 5, 1));
  EXPECT_EQ(clock_->Sleeps(), (std::vector<uint32_t>{100, 100, 100, 100}));
}

TEST_F(DebugLogTest, SettingsAreReadOnceUntilLoadedAgain) {
  UseMask(Category(5) | Level(4));
  EXPECT_TRUE(DebugLog("first", 5, 4));
  // A changed registry counts only once the settings are read again.
  platform::UseRegistryStore(platform::RegistryStore());
  EXPECT_TRUE(DebugLog("second", 5, 4));
  LoadDebugSettings();
  EXPECT_FALSE(DebugLog("third", 5, 4));
  EXPECT_EQ(Read(log_).find("third"), std::string::npos);
}

TEST_F(DebugLogTest, UnknownCodesPrintWithTheirNumber) {
  EXPECT_EQ(CategoryName(20), "20LOGID");
  EXPECT_EQ(CategoryName(-3), "-3LOGID");
  EXPECT_EQ(LevelName(9), "9LEVEL");
  // Another part of the family reads category 2 by this tag.
  EXPECT_EQ(CategoryName(2), "SYN");
}

}  // namespace
}  // namespace kelqln
