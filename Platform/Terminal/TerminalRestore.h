// SPDX-License-Identifier: Apache-2.0
// A terminal is left as it was, also by a program that dies.
#pragma once

#include <termios.h>

#include <string>

namespace kelvasi::terminal {

// While it lives, a standard error that is a terminal is held back, up to what a pipe holds, and told at its
// end. std::terminate and the signals of a fault write `leave` to the terminal and give it its modes back
// before they do what they do anyway. One at a time in a process.
class TerminalRestore {
 public:
  // `modes`: as they were. `leave`: up to 512 bytes.
  TerminalRestore(int descriptor, const termios& modes, const std::string& leave);
  ~TerminalRestore();
  TerminalRestore(const TerminalRestore&) = delete;
  TerminalRestore& operator=(const TerminalRestore&) = delete;
};

}  // namespace kelvasi::terminal
