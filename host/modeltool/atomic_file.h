// Whole-file reads and writes for model and settings files. A write never
// leaves a half-written file behind: readers see the old file or the new
// one, also after a crash or a full disk.
#ifndef KELQLN_HOST_MODELTOOL_ATOMIC_FILE_H_
#define KELQLN_HOST_MODELTOOL_ATOMIC_FILE_H_

#include <cstddef>
#include <string>
#include <string_view>

namespace host::modeltool {

// Writes `contents` to a new temporary file in the directory of `path`,
// flushes it to the disk and renames it over `path`. On failure the
// temporary file is removed, `path` is as it was, and the error is
// automation::kPathFileAccessError "<path>: <reason>".
void WriteFileAtomically(const std::string& path, std::string_view contents);

// The whole file. kFileNotFound when it does not exist, kPathFileAccessError
// when it cannot be read, kBadFileFormat when it is larger than `max_size`.
std::string ReadWholeFile(const std::string& path, size_t max_size);

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_ATOMIC_FILE_H_
