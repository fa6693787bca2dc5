// SPDX-License-Identifier: Apache-2.0
// The terminal of the process, by ncurses.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "Platform/Terminal/Terminal.h"
#include "Platform/Terminal/Theme.h"

namespace kelvasi::terminal {

// By the environment: LC_ALL, LC_CTYPE, LANG. To be asked before anything else sets a locale.
CharacterSet charactersOfLocale();

class CursesTerminal : public Terminal {
 public:
  // One at a time. Throws std::runtime_error, for people, where the standard output is no terminal or TERM
  // names none that can move its cursor. SIGWINCH and SIGTSTP are held back while it lives, and come in by
  // signalDescriptor().
  CursesTerminal(CharacterSet characters, const Theme& theme);
  ~CursesTerminal() override;
  CursesTerminal(const CursesTerminal&) = delete;
  CursesTerminal& operator=(const CursesTerminal&) = delete;

  // Descriptors to be watched: when there is something to read, next() has keys, and takeSignals() something
  // to do.
  int input() const;
  int signalDescriptor() const;
  // Takes a new size; stops the process as Ctrl+Z asks for, and goes on with it.
  void takeSignals();

  Size size() const override;
  CharacterSet characters() const override { return characters_; }
  bool hasColours() const override;
  void show(const Grid& grid, std::optional<Place> cursor) override;
  std::optional<Key> next() override;
  bool isThere() const override;
  void redraw() override;
  bool copy(std::string_view text) override;

 private:
  class Library;

  CharacterSet characters_;
  std::unique_ptr<Library> library_;
  std::optional<Grid> shown_;
};

// Why no terminal can be used, for people; empty when one can.
std::string whyNoTerminal();

}  // namespace kelvasi::terminal
