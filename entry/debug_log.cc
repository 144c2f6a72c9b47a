#include "entry/debug_log.h"

#include <exception>
#include <filesystem>

#include "automation/case_folding.h"
#include "automation/error.h"
#include "automation/variant.h"
#include "entry/add_in_services.h"
#include "platform/clock.h"
#include "platform/files.h"
#include "platform/message_box.h"

namespace kelqln {
namespace {

constexpr char kLogFileName[] = "keldebuglog.txt";
constexpr int kWriteAttempts = 5;
constexpr uint32_t kWaitBetweenAttemptsMs = 100;
constexpr size_t kNameWidth = 8;

struct DebugSettings {
  bool loaded = false;
  uint32_t mask = 0;
  std::string log_file;
  std::string suppress_time_stamps;  // lower case
};

DebugSettings& Settings() {
  static DebugSettings* settings = new DebugSettings;  // outlives teardown
  return *settings;
}

automation::Variant ReadSetting(std::string_view name) {
  return ReadRegistryValue(platform::kHkeyLocalMachine, kVSAddInKey, name);
}

std::string ReadLogFileName() {
  std::string file = automation::CStr(ReadSetting("DebugOutputFile"));
  if (!file.empty()) return file;
  // The installation directory names a folder, not a file: the log goes
  // inside it.
  std::string directory = automation::CStr(ReadSetting("InstallDir"));
  if (!directory.empty()) {
    return (std::filesystem::path(directory) / kLogFileName).string();
  }
  return platform::DefaultDebugLogPath();
}

std::string Padded(std::string name) {
  if (name.size() < kNameWidth) name.resize(kNameWidth, ' ');
  return name;
}

}  // namespace

bool DebugLog(std::string_view message, int32_t category, int32_t level) {
  if (!ShouldLog(category, level)) return false;
  try {
    const DebugSettings& settings = Settings();
    if (settings.log_file.empty()) {
      platform::MessageBox(platform::NowText() + " " + std::string(message),
                           "kelQLN", platform::kMbOk);
      return true;
    }
    std::string line;
    if (settings.suppress_time_stamps != "true") {
      line = platform::NowText() + " (" +
             automation::SingleToText(platform::Timer()) + ") ";
    }
    line += " " + Padded(LevelName(level)) + " " +
            Padded(CategoryName(category)) + "  " + std::string(message);
    platform::AppendLine(settings.log_file, line, kWriteAttempts,
                         kWaitBetweenAttemptsMs);
  } catch (const automation::Error&) {
    // A trace must never break the work it traces.
  } catch (const std::exception&) {
  }
  return true;
}

bool ShouldLog(int32_t category, int32_t level) {
  if (!Settings().loaded) LoadDebugSettings();
  const uint32_t mask = Settings().mask;
  const int32_t c = category >= 0 && category <= 14 ? category : 0;
  if ((mask & (1u << c)) == 0 || c == 0) return false;
  const int32_t l = level >= 0 && level <= 6 ? level : 6;
  return (mask & (1u << (24 + l))) != 0;
}

void LoadDebugSettings() {
  DebugSettings& settings = Settings();
  settings = DebugSettings();
  // Marked first: a registry that fails once is not asked again on every
  // call.
  settings.loaded = true;
  try {
    settings.mask =
        static_cast<uint32_t>(automation::CLng(ReadSetting("Debug")));
    settings.log_file = ReadLogFileName();
    settings.suppress_time_stamps = automation::FoldCase(
        automation::CStr(ReadSetting("SuppressTimeStamps")));
  } catch (const automation::Error&) {
    // A value of the wrong kind ends the reading; what was read stays.
  }
}

void ResetDebugSettings() { Settings() = DebugSettings(); }

std::string CategoryName(int32_t category) {
  switch (category) {
    case 0:
      return "UNKNOWN";
    case 1:
      return "RTE";
    case 2:
      return "SYN";
    case 3:
      return "MERGE";
    case 4:
      return "DOC";
    case 5:
      return "QLN";
    case 6:
      return "VCS";
    case 7:
      return "ADDIN";
    case 8:
      return "APPSTART";
    case 9:
      return "MCHECK";
    case 10:
      return "SGEN";
    case 11:
      return "CODEVIEW";
    case 12:
      return "IDE";
    case 13:
      return "RES";
    case 14:
      return "KVCADDIN";
    default:
      return std::to_string(category) + "LOGID";
  }
}

std::string LevelName(int32_t level) {
  switch (level) {
    case 0:
      return "CRITICAL";
    case 1:
      return "ERROR";
    case 2:
      return "WARNING";
    case 3:
      return "INFO";
    case 4:
      return "TRACE";
    case 5:
      return "TIMING";
    case 6:
      return "DEBUG";
    default:
      return std::to_string(level) + "LEVEL";
  }
}

}  // namespace kelqln
