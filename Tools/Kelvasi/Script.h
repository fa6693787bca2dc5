// SPDX-License-Identifier: Apache-2.0
// Leads the viewer through a script, a command a line: for pictures and tests of the program as it is. The
// commands are described in Docs/viewer-script.md.
#pragma once

#include <QByteArray>
#include <QSocketNotifier>
#include <QTimer>
#include <memory>
#include <optional>
#include <string>

#include "Platform/Posix/InputFile.h"
#include "Tools/Kelvasi/ScriptCommands.h"

namespace kelvasi {

class Script {
 public:
  // From a file, "-" for the standard input; an empty name is no script. Needs a QApplication, whose event
  // loop ends when the script has ended or a command failed. Throws std::system_error when the file cannot be
  // opened.
  explicit Script(const std::string& path);

  // Whether a command failed; which, the standard error was told.
  bool hasFailed() const { return hasFailed_; }

 private:
  void readMore();
  void advance();
  // False when there is none yet.
  bool takeLine();
  void fail(const std::string& why);
  void end();

  std::optional<InputFile> file_;
  std::unique_ptr<QSocketNotifier> more_;
  QByteArray unread_;
  bool isAtEnd_ = false;

  QTimer turn_;
  int lineNumber_ = 0;
  ScriptStep step_;  // null between two lines
  int turnsLeft_ = 0;
  bool hasFailed_ = false;
};

}  // namespace kelvasi
