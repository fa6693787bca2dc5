// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/ChildCommand.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <string_view>
#include <system_error>
#include <thread>

extern char** environ;

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto grace = 2000ms;  // after being asked to end
constexpr auto pause = 10ms;

// Where the streams of the program go.
class Streams {
 public:
  Streams() {
    posix_spawn_file_actions_init(&actions_);
    posix_spawn_file_actions_addopen(&actions_, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
    posix_spawn_file_actions_adddup2(&actions_, STDERR_FILENO, STDOUT_FILENO);
  }
  ~Streams() { posix_spawn_file_actions_destroy(&actions_); }
  Streams(const Streams&) = delete;
  Streams& operator=(const Streams&) = delete;

  const posix_spawn_file_actions_t* get() const { return &actions_; }

 private:
  posix_spawn_file_actions_t actions_{};
};

// No signal is blocked or ignored there that is so here.
class Attributes {
 public:
  Attributes() {
    sigset_t none;
    sigset_t all;
    sigemptyset(&none);
    sigfillset(&all);
    posix_spawnattr_init(&attributes_);
    posix_spawnattr_setsigmask(&attributes_, &none);
    posix_spawnattr_setsigdefault(&attributes_, &all);
    posix_spawnattr_setflags(&attributes_, POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF);
  }
  ~Attributes() { posix_spawnattr_destroy(&attributes_); }
  Attributes(const Attributes&) = delete;
  Attributes& operator=(const Attributes&) = delete;

  const posix_spawnattr_t* get() const { return &attributes_; }

 private:
  posix_spawnattr_t attributes_{};
};

std::vector<std::string> environmentWith(const ChildCommand::Variables& variables) {
  std::vector<std::string> environment;
  for (char** entry = environ; *entry; ++entry) {
    const std::string_view old = *entry;
    const bool isReplaced = std::ranges::any_of(
        variables, [&](const auto& variable) { return old.substr(0, old.find('=')) == variable.first; });
    if (!isReplaced) environment.emplace_back(old);
  }
  for (const auto& [name, value] : variables) {
    environment.push_back(name + "=" + value.substr(0, value.find('\0')));
  }
  return environment;
}

std::vector<char*> pointersTo(std::vector<std::string>& texts) {
  std::vector<char*> pointers;
  for (std::string& text : texts) pointers.push_back(text.data());
  pointers.push_back(nullptr);
  return pointers;
}

}  // namespace

ChildCommand::~ChildCommand() {
  end(0ms);
}

std::optional<std::string> ChildCommand::start(const Variables& variables) {
  std::vector<std::string> environment = environmentWith(variables);
  const auto arguments = pointersTo(arguments_);
  const auto entries = pointersTo(environment);
  const int error = ::posix_spawnp(&process_, arguments_.front().c_str(), Streams().get(), Attributes().get(),
                                   arguments.data(), entries.data());
  if (error == 0) return std::nullopt;
  process_ = 0;
  return arguments_.front() + ": " + std::generic_category().message(error);
}

bool ChildCommand::isRunning() {
  if (process_ == 0) return false;
  int status = 0;
  const pid_t ended = ::waitpid(process_, &status, WNOHANG);
  if (ended == 0) return true;
  noteEnd(ended < 0 ? 0 : status);
  return false;
}

void ChildCommand::wait() {
  if (process_ == 0) return;
  int status = 0;
  pid_t ended = 0;
  do {
    ended = ::waitpid(process_, &status, 0);
  } while (ended < 0 && errno == EINTR);
  noteEnd(ended < 0 ? 0 : status);
}

void ChildCommand::end(std::chrono::milliseconds patience) {
  if (hasEndedWithin(patience)) return;
  ::kill(process_, SIGTERM);
  if (hasEndedWithin(grace)) return;
  ::kill(process_, SIGKILL);
  wait();
}

bool ChildCommand::hasEndedWithin(std::chrono::milliseconds time) {
  for (; isRunning(); time -= pause) {
    if (time <= 0ms) return false;
    std::this_thread::sleep_for(pause);
  }
  return true;
}

void ChildCommand::noteEnd(int status) {
  process_ = 0;
  if (!WIFEXITED(status) || WEXITSTATUS(status) != 0) ++failures_;
}

}  // namespace kelvasi
