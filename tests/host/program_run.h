// Runs the built kelqln program as a user would: arguments, standard input,
// and the environment of a clean user account (no registry or settings file
// of the person running the tests), with its standard output, standard
// error and exit status collected through files.
#ifndef KELQLN_TESTS_HOST_PROGRAM_RUN_H_
#define KELQLN_TESTS_HOST_PROGRAM_RUN_H_

#include <fcntl.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

namespace testing_support {

inline std::string ReadText(const std::filesystem::path& path) {
  std::ifstream in(path, std::ios::binary);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

inline void WriteText(const std::filesystem::path& path,
                      const std::string& text) {
  std::ofstream(path, std::ios::binary) << text;
}

inline std::vector<std::string> LinesOf(const std::string& text) {
  std::vector<std::string> lines;
  std::istringstream in(text);
  for (std::string line; std::getline(in, line);) lines.push_back(line);
  return lines;
}

class ProgramRun {
 public:
  // Starts the program in the working directory `directory`, which also
  // receives the files of its output and its home, with `input` as its
  // standard input.
  ProgramRun(const std::filesystem::path& directory,
             const std::vector<std::string>& args,
             const std::string& input = "")
      : out_(directory / ".stdout"), err_(directory / ".stderr") {
    std::filesystem::path in = directory / ".stdin";
    WriteText(in, input);
    std::filesystem::path home = directory / ".home";
    std::filesystem::create_directories(home);
    pid_ = ::fork();
    if (pid_ < 0) throw std::runtime_error("fork failed");
    if (pid_ > 0) return;
    ::unsetenv("KELQLN_REGISTRY");
    ::unsetenv("KELQLN_SETTINGS");
    ::unsetenv("XDG_CONFIG_HOME");
    ::setenv("HOME", home.c_str(), 1);
    if (::chdir(directory.c_str()) != 0) ::_exit(126);
    Redirect(in, O_RDONLY, 0);
    Redirect(out_, O_WRONLY | O_CREAT | O_TRUNC, 1);
    Redirect(err_, O_WRONLY | O_CREAT | O_TRUNC, 2);
    std::vector<char*> argv{const_cast<char*>(KELQLN_PROGRAM)};
    for (const std::string& arg : args)
      argv.push_back(const_cast<char*>(arg.c_str()));
    argv.push_back(nullptr);
    ::execv(KELQLN_PROGRAM, argv.data());
    ::_exit(127);
  }
  ~ProgramRun() {
    if (status_ < 0) {
      ::kill(pid_, SIGKILL);
      Wait();
    }
  }

  // Waits (up to `limit`) for the program to write a whole line on its
  // standard output; false when it did not.
  bool AwaitFirstLine(std::chrono::seconds limit) const {
    auto deadline = std::chrono::steady_clock::now() + limit;
    while (ReadText(out_).find('\n') == std::string::npos) {
      if (std::chrono::steady_clock::now() > deadline) return false;
      std::this_thread::sleep_for(std::chrono::milliseconds(1));
    }
    return true;
  }
  void Kill() const { ::kill(pid_, SIGKILL); }

  // The wait status.
  int Wait() {
    if (status_ < 0) ::waitpid(pid_, &status_, 0);
    return status_;
  }
  // The exit code, or -1 when a signal ended the program.
  int ExitCode() {
    int status = Wait();
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  }
  std::string Out() const { return ReadText(out_); }
  std::string Err() const { return ReadText(err_); }

 private:
  static void Redirect(const std::filesystem::path& path, int flags, int fd) {
    int opened = ::open(path.c_str(), flags, 0644);
    if (opened < 0 || ::dup2(opened, fd) < 0) ::_exit(126);
    ::close(opened);
  }

  std::filesystem::path out_;
  std::filesystem::path err_;
  pid_t pid_ = -1;
  int status_ = -1;
};

}  // namespace testing_support

#endif  // KELQLN_TESTS_HOST_PROGRAM_RUN_H_
