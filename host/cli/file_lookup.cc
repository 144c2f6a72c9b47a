#include "host/cli/file_lookup.h"

#include <cstdlib>
#include <filesystem>
#include <string>
#include <system_error>
#include <vector>

#include "host/cli/usage_error.h"
#include "platform/registry.h"

namespace host::cli {
namespace {

namespace fs = std::filesystem;

fs::path ProgramDirectory() {
  std::error_code error;
  fs::path program = fs::read_symlink("/proc/self/exe", error);
  return error ? fs::path() : program.parent_path();
}

bool IsFile(const fs::path& path) {
  std::error_code error;
  return fs::is_regular_file(path, error);
}

// The first of `candidates` that is a file, or "".
std::string FirstFile(const std::vector<fs::path>& candidates) {
  for (const fs::path& candidate : candidates) {
    if (!candidate.empty() && IsFile(candidate)) return candidate.string();
  }
  return "";
}

std::string Listed(const std::vector<fs::path>& candidates) {
  std::string text;
  for (const fs::path& candidate : candidates) {
    if (candidate.empty()) continue;
    text += (text.empty() ? "" : ", ") + candidate.string();
  }
  return text;
}

std::string RequireFile(const std::string& path, const std::string& named_by) {
  if (!IsFile(path)) {
    throw UsageError(path + ": no such registry file (named by " + named_by +
                     ")");
  }
  return path;
}

}  // namespace

std::string FindRegistryFile(const std::string& option) {
  if (!option.empty()) return RequireFile(option, "--registry");
  const char* variable = std::getenv("KELQLN_REGISTRY");
  if (variable != nullptr && *variable != '\0') {
    return RequireFile(variable, "KELQLN_REGISTRY");
  }
  std::vector<fs::path> candidates = {
      platform::RegistryFilePath(),
      (ProgramDirectory() / "../share/kelqln/registry.reg").lexically_normal(),
      KELQLN_SOURCE_REGISTRY,
  };
  std::string found = FirstFile(candidates);
  if (found.empty()) {
    throw UsageError("no registry file found (looked for " +
                     Listed(candidates) + "); name one with --registry");
  }
  return found;
}

std::string FindAddInLibrary() {
  const char* variable = std::getenv("KELQLN_LIBRARY");
  if (variable != nullptr && *variable != '\0') {
    if (!IsFile(variable)) {
      throw UsageError(std::string(variable) +
                       ": no such library (named by KELQLN_LIBRARY)");
    }
    return variable;
  }
  fs::path directory = ProgramDirectory();
  std::vector<fs::path> candidates = {
      directory / "libkelqln.so",
      (directory / "../lib/libkelqln.so").lexically_normal()};
  std::string found = FirstFile(candidates);
  if (found.empty()) {
    throw UsageError(
        "the add-in library libkelqln.so was not found (looked for " +
        Listed(candidates) + "); name it with KELQLN_LIBRARY");
  }
  return found;
}

}  // namespace host::cli
