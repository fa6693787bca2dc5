// SPDX-License-Identifier: Apache-2.0
// ncurses, begun and ended; and what it asks the process for.
#pragma once

#include <signal.h>
#include <termios.h>

#include <array>
#include <memory>
#include <optional>
#include <string>

// The library's header has macros by common names; without them it is a library of functions.
#define NCURSES_NOMACROS 1
#define NCURSES_WIDECHAR 1
#include <curses.h>

#include "Platform/Posix/FileDescriptor.h"
#include "Platform/Terminal/CursesTerminal.h"
#include "Platform/Terminal/TerminalRestore.h"

namespace kelvasi::terminal {

// How a role is drawn with as many colours as there are.
struct CursesStyle {
  attr_t attributes = A_NORMAL;
  int pair = 0;
};

class CursesTerminal::Library {
 public:
  Library(CharacterSet characters, const Theme& theme);
  ~Library();
  Library(const Library&) = delete;
  Library& operator=(const Library&) = delete;

  int input() const { return input_; }
  int signalDescriptor() const { return signals_.number(); }
  bool hasColours() const { return hasColours_; }
  CursesStyle styleOf(Role role) const { return styles_[static_cast<std::size_t>(role)]; }
  // Whether the line to the terminal has still to send what it was given.
  bool isBusy() const;
  void takeSize();
  void suspend();
  void write(const std::string& bytes) const;

 private:
  void begin(const std::string& type);
  void prepareColours(const Theme& theme);
  void holdSignals();

  FileDescriptor ownInput_;  // where the standard input is none
  int input_ = 0;
  termios before_{};
  SCREEN* screen_ = nullptr;
  bool hasColours_ = false;
  bool canStop_ = true;
  std::array<CursesStyle, roles> styles_{};
  sigset_t held_{};
  sigset_t maskBefore_{};
  FileDescriptor signals_;
  std::optional<TerminalRestore> restore_;
};

}  // namespace kelvasi::terminal
