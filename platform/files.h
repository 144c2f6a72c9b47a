// The few file services the system needs, with the behaviour of the calls it
// would make on Windows: appending a log line, probing a file, and the
// platform's paths.
#ifndef KELQLN_PLATFORM_FILES_H_
#define KELQLN_PLATFORM_FILES_H_

#include <cstdint>
#include <string>
#include <string_view>

namespace platform {

// Appends `line` and "\r\n" to `path` (created when missing), opening and
// closing the file each time so other writers can share it. A failed attempt
// is retried after `wait_milliseconds` through platform::Sleep, up to
// `attempts` attempts in all (at least one). Returns whether the line was
// written.
bool AppendLine(const std::string& path, std::string_view line,
                int attempts = 5, uint32_t wait_milliseconds = 100);

// Whether `path` is a file that can be opened for reading now.
bool CanOpenForReading(const std::string& path);

// $TMPDIR, else "/tmp".
std::string TempDirectory();

// "keldebuglog.txt" in TempDirectory().
std::string DefaultDebugLogPath();

// The base name of the program or shared library holding
// `address_in_module`, without "lib" before it nor extensions after it
// ("/usr/lib/libkelqln.so.1" gives "kelqln"); "" when no module holds it.
std::string ModuleBaseName(const void* address_in_module);

}  // namespace platform

#endif  // KELQLN_PLATFORM_FILES_H_
