// SPDX-License-Identifier: Apache-2.0
// The standard output of `monitor`: on a terminal each text takes the place of the one before, elsewhere
// texts follow one another.
#pragma once

#include <string>

namespace kelvasi {

// What draws `text`, whole lines, over the text drawn before on a terminal of `rows` lines: from the top,
// each line cleared behind its end and cut at the right edge, then all below cleared. A text that does not
// fit is cut, and its last line says by how much.
std::string redrawing(const std::string& text, std::size_t rows);

class MonitorView {
 public:
  MonitorView();

  bool isTerminal() const { return isTerminal_; }
  // Redraws on a terminal; elsewhere appends, with a line "---" behind. Throws ToolError.
  void show(const std::string& text);

 private:
  bool isTerminal_;
  bool isDrawn_ = false;
};

}  // namespace kelvasi
