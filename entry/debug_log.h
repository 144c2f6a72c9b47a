// The diagnostic trace shared by the whole tool family. A call names a
// category (who writes) and a level (how important the line is); a bit mask
// read once from the registry decides which calls write: bit `c` (0 to 14)
// enables category `c`, bit 24 + `l` enables level `l` (0 to 6), and a line
// needs both. With the mask at 0 a call costs one mask test.
//
// The settings are values of the key
//   HKEY_LOCAL_MACHINE\SOFTWARE\Quenta Software\Orel\AddIns\VisualStudio
// "Debug" is the mask; "DebugOutputFile" the log file (when empty,
// keldebuglog.txt in the "InstallDir" directory, else in the temporary
// directory); "SuppressTimeStamps" set to "true" in any letter case leaves
// the time stamps out.
#ifndef KELQLN_ENTRY_DEBUG_LOG_H_
#define KELQLN_ENTRY_DEBUG_LOG_H_

#include <cstdint>
#include <string>
#include <string_view>

namespace kelqln {

// The category of this library's lines.
inline constexpr int32_t kDebugCategoryQln = 5;

inline constexpr int32_t kDebugLevelCritical = 0;
inline constexpr int32_t kDebugLevelError = 1;
inline constexpr int32_t kDebugLevelWarning = 2;
inline constexpr int32_t kDebugLevelInfo = 3;
inline constexpr int32_t kDebugLevelTrace = 4;
inline constexpr int32_t kDebugLevelTiming = 5;
inline constexpr int32_t kDebugLevelDebug = 6;

// Appends one line to the log file when the mask lets the category and level
// through: time stamp, blank, level name and blank, category name (both
// padded to 8), two blanks, the message, CR LF. A line that cannot be written
// in 5 attempts 100 ms apart is dropped; nothing the logger meets reaches the
// caller. Returns whether the call passed the mask test.
bool DebugLog(std::string_view message, int32_t category, int32_t level);

// The mask test alone, loading the settings first when needed. A category
// outside 0 to 14 is tested as 0, which never writes; a level outside 0 to
// 6 is tested as level 6.
bool ShouldLog(int32_t category, int32_t level);

// Reads the settings from the registry. They are kept for the life of the
// library; a value that cannot be read leaves the ones read before it.
void LoadDebugSettings();

// Forgets the settings, so the next call reads the registry again. The
// library itself never does: this is for hosts and tests that change the
// registry within one process.
void ResetDebugSettings();

// "QLN" for 5 and the other names of the family; an unknown code prints as
// its number and "LOGID".
std::string CategoryName(int32_t category);

// "CRITICAL" to "DEBUG"; an unknown code prints as its number and "LEVEL".
std::string LevelName(int32_t level);

}  // namespace kelqln

#endif  // KELQLN_ENTRY_DEBUG_LOG_H_
