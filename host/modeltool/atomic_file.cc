#include "host/modeltool/atomic_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <cerrno>
#include <cstdint>
#include <cstring>
#include <filesystem>
#include <string>

#include "automation/error.h"

namespace host::modeltool {
namespace {

[[noreturn]] void Fail(int number, const std::string& path,
                       const std::string& what, int error) {
  throw automation::Error(
      number, path + ": " + what + " (" + std::strerror(error) + ")");
}

// A descriptor that is closed on every way out.
class FileDescriptor {
 public:
  explicit FileDescriptor(int fd) : fd_(fd) {}
  ~FileDescriptor() {
    if (fd_ >= 0) ::close(fd_);
  }
  FileDescriptor(const FileDescriptor&) = delete;
  FileDescriptor& operator=(const FileDescriptor&) = delete;
  int Get() const { return fd_; }
  // Closes now; the result of close is part of a write's success.
  int Close() {
    int result = ::close(fd_);
    fd_ = -1;
    return result;
  }

 private:
  int fd_;
};

bool WriteAll(int fd, std::string_view data) {
  while (!data.empty()) {
    ssize_t written = ::write(fd, data.data(), data.size());
    if (written < 0) {
      if (errno == EINTR) continue;
      return false;
    }
    data.remove_prefix(static_cast<size_t>(written));
  }
  return true;
}

}  // namespace

void WriteFileAtomically(const std::string& path, std::string_view contents) {
  namespace fs = std::filesystem;
  fs::path target(path);
  fs::path directory = target.parent_path();
  if (directory.empty()) directory = ".";
  static std::atomic<unsigned> counter{0};
  // A name of our own beside the target: the rename stays within one file
  // system, so it replaces the target in one step.
  std::string temporary;
  int fd = -1;
  for (int attempt = 0; fd < 0; ++attempt) {
    temporary = (directory /
                 ("." + target.filename().string() + ".tmp-" +
                  std::to_string(::getpid()) + "-" + std::to_string(counter++)))
                    .string();
    fd = ::open(temporary.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC,
                0666);
    if (fd < 0 && (errno != EEXIST || attempt == 100)) {
      Fail(automation::kPathFileAccessError, path,
           "cannot create a temporary file in " + directory.string(), errno);
    }
  }
  FileDescriptor file(fd);
  auto abandon = [&](const std::string& what) {
    int error = errno;
    ::unlink(temporary.c_str());
    Fail(automation::kPathFileAccessError, path, what, error);
  };
  if (!WriteAll(file.Get(), contents)) abandon("cannot write the file");
  if (::fsync(file.Get()) != 0) abandon("cannot flush the file to the disk");
  if (file.Close() != 0) abandon("cannot close the file");
  if (::rename(temporary.c_str(), path.c_str()) != 0) {
    abandon("cannot replace the file");
  }
  // The new name is in place; making the directory entry durable too is
  // best effort, as some file systems refuse fsync on a directory and the
  // file is complete under either name.
  int directory_fd = ::open(directory.c_str(), O_RDONLY | O_DIRECTORY);
  if (directory_fd >= 0) {
    ::fsync(directory_fd);
    ::close(directory_fd);
  }
}

std::string ReadWholeFile(const std::string& path, size_t max_size) {
  int fd = ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
  if (fd < 0) {
    Fail(errno == ENOENT ? automation::kFileNotFound
                         : automation::kPathFileAccessError,
         path, "cannot open the file", errno);
  }
  FileDescriptor file(fd);
  struct stat info;
  if (::fstat(fd, &info) != 0) {
    Fail(automation::kPathFileAccessError, path, "cannot read the file", errno);
  }
  if (!S_ISREG(info.st_mode)) {
    throw automation::Error(automation::kPathFileAccessError,
                            path + ": not a regular file");
  }
  if (static_cast<uint64_t>(info.st_size) > max_size) {
    throw automation::Error(automation::kBadFileFormat,
                            path + ": the file is larger than " +
                                std::to_string(max_size) + " bytes");
  }
  std::string contents;
  contents.resize(static_cast<size_t>(info.st_size));
  size_t done = 0;
  while (true) {
    if (done == contents.size()) {
      // The file may have grown since fstat: read on, within the limit.
      if (contents.size() >= max_size + 1) break;
      contents.resize(std::min(max_size + 1, contents.size() + 65536));
    }
    ssize_t got = ::read(fd, contents.data() + done, contents.size() - done);
    if (got < 0) {
      if (errno == EINTR) continue;
      Fail(automation::kPathFileAccessError, path, "cannot read the file",
           errno);
    }
    if (got == 0) break;
    done += static_cast<size_t>(got);
  }
  contents.resize(done);
  if (done > max_size) {
    throw automation::Error(automation::kBadFileFormat,
                            path + ": the file is larger than " +
                                std::to_string(max_size) + " bytes");
  }
  return contents;
}

}  // namespace host::modeltool
