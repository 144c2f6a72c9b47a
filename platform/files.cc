#include "platform/files.h"

#include <dlfcn.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <filesystem>

#include "platform/clock.h"

namespace platform {
namespace {

bool WriteAll(int fd, std::string_view bytes) {
  while (!bytes.empty()) {
    ssize_t written = ::write(fd, bytes.data(), bytes.size());
    if (written < 0 && errno == EINTR) continue;
    if (written <= 0) return false;
    bytes.remove_prefix(static_cast<size_t>(written));
  }
  return true;
}

bool AppendOnce(const std::string& path, std::string_view bytes) {
  int fd =
      ::open(path.c_str(), O_WRONLY | O_APPEND | O_CREAT | O_CLOEXEC, 0666);
  if (fd < 0) return false;
  bool written = WriteAll(fd, bytes);
  return ::close(fd) == 0 && written;
}

}  // namespace

bool AppendLine(const std::string& path, std::string_view line, int attempts,
                uint32_t wait_milliseconds) {
  // One write of the whole line keeps lines of concurrent writers whole.
  std::string bytes(line);
  bytes += "\r\n";
  for (int attempt = 1;; ++attempt) {
    if (AppendOnce(path, bytes)) return true;
    if (attempt >= attempts) return false;
    Sleep(wait_milliseconds);
  }
}

bool CanOpenForReading(const std::string& path) {
  int fd = ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
  if (fd < 0) return false;
  struct stat status;
  bool is_file = ::fstat(fd, &status) == 0 && !S_ISDIR(status.st_mode);
  ::close(fd);
  return is_file;
}

std::string TempDirectory() {
  const char* directory = std::getenv("TMPDIR");
  return directory != nullptr && *directory != '\0' ? directory : "/tmp";
}

std::string DefaultDebugLogPath() {
  return (std::filesystem::path(TempDirectory()) / "keldebuglog.txt").string();
}

std::string ModuleBaseName(const void* address_in_module) {
  Dl_info info;
  if (address_in_module == nullptr || ::dladdr(address_in_module, &info) == 0 ||
      info.dli_fname == nullptr) {
    return "";
  }
  std::string name = std::filesystem::path(info.dli_fname).filename().string();
  if (name.starts_with("lib")) name.erase(0, 3);
  return name.substr(0, name.find('.'));
}

}  // namespace platform
