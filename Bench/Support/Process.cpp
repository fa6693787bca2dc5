// SPDX-License-Identifier: Apache-2.0
#include "Bench/Support/Process.h"

#include <fcntl.h>
#include <signal.h>
#include <spawn.h>
#include <stdlib.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <filesystem>
#include <system_error>
#include <utility>

namespace kelvasi::bench {

namespace {

void require(int error, const char* what) {
  if (error != 0) throw std::system_error(error, std::generic_category(), what);
}

class FileActions {
 public:
  FileActions() { ::posix_spawn_file_actions_init(&actions_); }
  ~FileActions() { ::posix_spawn_file_actions_destroy(&actions_); }
  FileActions(const FileActions&) = delete;
  FileActions& operator=(const FileActions&) = delete;
  posix_spawn_file_actions_t* get() { return &actions_; }

 private:
  posix_spawn_file_actions_t actions_;
};

}  // namespace

Process::Process(const std::string& program, const std::vector<std::string>& arguments, Output output) {
  std::vector<char*> argv{const_cast<char*>(program.c_str())};
  for (const std::string& argument : arguments) argv.push_back(const_cast<char*>(argument.c_str()));
  argv.push_back(nullptr);
  FileActions actions;
  std::array<int, 2> ends{-1, -1};
  if (output == Output::dropped) {
    ::posix_spawn_file_actions_addopen(actions.get(), STDOUT_FILENO, "/dev/null", O_WRONLY, 0);
  } else {
    require(::pipe2(ends.data(), O_CLOEXEC) == 0 ? 0 : errno, "pipe");
    ::posix_spawn_file_actions_adddup2(actions.get(), ends[1], STDOUT_FILENO);
  }
  const int error = ::posix_spawn(&process_, program.c_str(), actions.get(), nullptr, argv.data(), environ);
  if (ends[1] >= 0) ::close(ends[1]);
  output_ = ends[0];
  require(error, program.c_str());
}

Process::~Process() {
  if (output_ >= 0) ::close(output_);
  if (process_ < 0) return;
  ::kill(process_, SIGTERM);
  waitForSuccess();
}

bool Process::waitForOutput() {
  char byte = 0;
  return ::read(output_, &byte, 1) == 1;
}

bool Process::waitForSuccess() {
  int status = 0;
  while (::waitpid(process_, &status, 0) < 0 && errno == EINTR) {
  }
  process_ = -1;
  return WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

PrivateRuntimeDirectory::PrivateRuntimeDirectory()
    : path_((std::filesystem::temp_directory_path() / "kelvasi-bench-XXXXXX").string()) {
  require(::mkdtemp(path_.data()) ? 0 : errno, path_.c_str());
  ::setenv("TELVON_RUNTIME_DIR", path_.c_str(), 1);
}

PrivateRuntimeDirectory::~PrivateRuntimeDirectory() {
  std::error_code ignored;  // nothing is left to be done about it
  std::filesystem::remove_all(path_, ignored);
}

}  // namespace kelvasi::bench
