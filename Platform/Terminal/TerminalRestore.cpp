// SPDX-License-Identifier: Apache-2.0
#include "Platform/Terminal/TerminalRestore.h"

#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <csignal>
#include <cstdlib>
#include <exception>

namespace kelvasi::terminal {

namespace {

constexpr std::array faults{SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGABRT, SIGSYS, SIGQUIT};

struct Kept {
  int descriptor = -1;
  termios modes{};
  std::array<char, 512> leave{};
  std::size_t length = 0;
  int standardError = -1;  // where it went before; -1: it was left alone
  int heldError = -1;      // what came since
  std::terminate_handler terminate = nullptr;
  std::array<struct sigaction, faults.size()> actions{};
};

// Handlers take a number or nothing, so it has to be reached this way.
Kept& kept() {
  static Kept one;
  return one;
}
std::atomic<bool>& isKept() {
  static std::atomic<bool> is = false;
  return is;
}

void holdError(Kept& terminal) {
  std::array<int, 2> pipe{};
  if (::isatty(STDERR_FILENO) != 1 || ::pipe2(pipe.data(), O_CLOEXEC | O_NONBLOCK) != 0) return;
  terminal.standardError = ::fcntl(STDERR_FILENO, F_DUPFD_CLOEXEC, STDERR_FILENO + 1);
  terminal.heldError = pipe[0];
  ::dup2(pipe[1], STDERR_FILENO);
  ::close(pipe[1]);
}

// Only what may be called in a handler of a signal, as in giveBack().
void tellError(Kept& terminal) {
  if (terminal.standardError < 0) return;
  ::dup2(terminal.standardError, STDERR_FILENO);
  std::array<char, 512> bytes;
  for (;;) {
    const ssize_t length = ::read(terminal.heldError, bytes.data(), bytes.size());
    if (length <= 0 || ::write(STDERR_FILENO, bytes.data(), static_cast<std::size_t>(length)) < 0) break;
  }
  ::close(terminal.standardError);
  ::close(terminal.heldError);
  terminal.standardError = -1;
}

void giveBack() {
  if (!isKept().exchange(false)) return;
  Kept& terminal = kept();
  // There is nowhere left to report a failure to.
  if (::write(terminal.descriptor, terminal.leave.data(), terminal.length) < 0) return;
  ::tcsetattr(terminal.descriptor, TCSANOW, &terminal.modes);
  tellError(terminal);
}

[[noreturn]] void terminate() {
  giveBack();
  kept().terminate();
  std::abort();
}

// The fault is then met again, or raised, as if nobody had been here.
void handle(int number) {
  giveBack();
  ::signal(number, SIG_DFL);
  ::raise(number);
}

}  // namespace

TerminalRestore::TerminalRestore(int descriptor, const termios& modes, const std::string& leave) {
  Kept& terminal = kept();
  terminal.descriptor = descriptor;
  terminal.modes = modes;
  terminal.length = std::min(leave.size(), terminal.leave.size());
  std::copy_n(leave.begin(), terminal.length, terminal.leave.begin());
  holdError(terminal);
  isKept() = true;
  terminal.terminate = std::set_terminate(terminate);
  struct sigaction action {};
  action.sa_handler = handle;
  for (std::size_t at = 0; at < faults.size(); ++at) ::sigaction(faults[at], &action, &terminal.actions[at]);
}

TerminalRestore::~TerminalRestore() {
  isKept() = false;
  tellError(kept());
  std::set_terminate(kept().terminate);
  for (std::size_t at = 0; at < faults.size(); ++at) ::sigaction(faults[at], &kept().actions[at], nullptr);
}

}  // namespace kelvasi::terminal
