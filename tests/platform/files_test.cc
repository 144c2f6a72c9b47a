#include "platform/files.h"

#include <gtest/gtest.h>
#include <stdlib.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "platform/clock.h"
#include "platform/manual_clock.h"

namespace platform {
namespace {

namespace fs = std::filesystem;

// Creates `dir` (unless empty) during the second wait, as when the program
// holding the log lets go of it.
class UnblockingClock : public ManualClock {
 public:
  explicit UnblockingClock(fs::path dir) : dir_(std::move(dir)) {}
  void Sleep(uint32_t milliseconds) override {
    ManualClock::Sleep(milliseconds);
    if (SleepCount() == 2 && !dir_.empty()) fs::create_directory(dir_);
  }

 private:
  fs::path dir_;
};

class FilesTest : public testing::Test {
 protected:
  void SetUp() override {
    dir_ = fs::path(testing::TempDir()) /
           testing::UnitTest::GetInstance()->current_test_info()->name();
    fs::remove_all(dir_);
    fs::create_directories(dir_);
  }
  void TearDown() override { SetClock(nullptr); }

  static std::string Read(const fs::path& path) {
    std::stringstream text;
    text << std::ifstream(path, std::ios::binary).rdbuf();
    return text.str();
  }

  fs::path dir_;
};

TEST_F(FilesTest, AppendLineRetriesUntilWritten) {
  struct Case {
    std::string dir;
    int attempts;
    uint32_t wait;
    std::vector<uint32_t> sleeps;
    bool written;
  };
  const std::vector<Case> cases = {
      {".", 5, 100, {}, true},
      {"missing", 5, 100, {100, 100, 100, 100}, false},
      {"missing", 3, 7, {7, 7}, false},
      {"missing", 0, 100, {}, false},
      {"unblocked", 5, 100, {100, 100}, true},
  };
  for (const Case& test : cases) {
    SCOPED_TRACE(test.dir + " " + std::to_string(test.attempts));
    auto clock = std::make_shared<UnblockingClock>(
        test.dir == "unblocked" ? dir_ / test.dir : fs::path());
    SetClock(clock);
    const fs::path path = dir_ / test.dir / "log.txt";
    EXPECT_EQ(AppendLine(path.string(), "line", test.attempts, test.wait),
              test.written);
    EXPECT_EQ(clock->Sleeps(), test.sleeps);
    EXPECT_EQ(fs::exists(path), test.written);
  }
}

TEST_F(FilesTest, AppendLineEndsLinesInCrLf) {
  const std::string path = (dir_ / "log.txt").string();
  EXPECT_TRUE(AppendLine(path, "first"));
  EXPECT_TRUE(AppendLine(path, ""));
  EXPECT_TRUE(AppendLine(path, "third line"));
  EXPECT_EQ(Read(path), "first\r\n\r\nthird line\r\n");
}

TEST_F(FilesTest, CanOpenForReadingOnlyReadableFiles) {
  std::ofstream(dir_ / "file.txt") << "x";
  std::ofstream(dir_ / "locked.txt") << "x";
  fs::permissions(dir_ / "locked.txt", fs::perms::none);
  EXPECT_TRUE(CanOpenForReading((dir_ / "file.txt").string()));
  EXPECT_FALSE(CanOpenForReading((dir_ / "missing.txt").string()));
  EXPECT_FALSE(CanOpenForReading(dir_.string()));
  if (geteuid() != 0) {  // root reads anything
    EXPECT_FALSE(CanOpenForReading((dir_ / "locked.txt").string()));
  }
}

TEST_F(FilesTest, DebugLogLivesInTmpdir) {
  const char* old = getenv("TMPDIR");
  const std::string saved = old ? old : "";
  setenv("TMPDIR", "/var/tmp/", 1);
  EXPECT_EQ(DefaultDebugLogPath(), "/var/tmp/keldebuglog.txt");
  setenv("TMPDIR", "", 1);
  EXPECT_EQ(DefaultDebugLogPath(), "/tmp/keldebuglog.txt");
  old ? setenv("TMPDIR", saved.c_str(), 1) : unsetenv("TMPDIR");
}

void FunctionInTheTestProgram() {}

TEST(ModuleBaseNameTest, NamesTheModuleHoldingAnAddress) {
  int on_the_stack = 0;
  EXPECT_EQ(ModuleBaseName(reinterpret_cast<const void*>(&AppendLine)),
            "kelqln_platform");
  EXPECT_EQ(
      ModuleBaseName(reinterpret_cast<const void*>(&FunctionInTheTestProgram)),
      "platform_test");
  EXPECT_EQ(ModuleBaseName(&on_the_stack), "");
}

}  // namespace
}  // namespace platform
