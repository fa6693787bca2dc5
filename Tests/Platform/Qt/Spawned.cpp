// SPDX-License-Identifier: Apache-2.0
#include "Tests/Platform/Qt/Spawned.h"

#include <fcntl.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <stdexcept>

namespace kelvasi::test {

Spawned::Spawned(std::vector<std::string> arguments) {
  arguments.insert(arguments.begin(), WIRE_PEER);
  std::vector<char*> raw;
  for (std::string& argument : arguments) raw.push_back(argument.data());
  raw.push_back(nullptr);
  std::array<int, 2> pipe{};
  if (::pipe2(pipe.data(), O_CLOEXEC) != 0) throw std::runtime_error("no pipe");
  process_ = ::fork();
  if (process_ == 0) {
    ::dup2(pipe[1], STDOUT_FILENO);
    ::execv(raw.front(), raw.data());
    ::_exit(127);
  }
  ::close(pipe[1]);
  output_.reset(::fdopen(pipe[0], "r"));
}

Spawned::~Spawned() {
  kill();
}

std::string Spawned::line() {
  std::array<char, 4096> text{};
  if (!std::fgets(text.data(), text.size(), output_.get())) return "(end)";
  std::string line = text.data();
  if (line.ends_with('\n')) line.pop_back();
  return line;
}

void Spawned::signal(int number) const {
  ::kill(process_, number);
}

void Spawned::stop() const {
  signal(SIGSTOP);
  ::waitpid(process_, nullptr, WUNTRACED);
}

void Spawned::resume() const {
  signal(SIGCONT);
}

void Spawned::kill() {
  if (process_ <= 0) return;
  signal(SIGKILL);
  ::waitpid(process_, nullptr, 0);
  process_ = -1;
}

}  // namespace kelvasi::test
