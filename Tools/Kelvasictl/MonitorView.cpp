// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/MonitorView.h"

#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>

#include "Tools/Kelvasictl/StandardStreams.h"

namespace kelvasi {

namespace {

// Control sequences of ECMA-48, and DEC's for the right edge.
constexpr const char* home = "\x1b[H";
constexpr const char* clearAll = "\x1b[2J";
constexpr const char* clearLine = "\x1b[K";
constexpr const char* clearBelow = "\x1b[J";
constexpr const char* cutAtEdge = "\x1b[?7l";
constexpr const char* wrapAtEdge = "\x1b[?7h";

std::size_t terminalRows() {
  constexpr std::size_t usual = 24;
  winsize size{};
  return ::ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) == 0 && size.ws_row > 0 ? size.ws_row : usual;
}

std::string remainder(std::size_t lines) {
  return "... and " + std::to_string(lines) + " lines more" + clearLine + "\n";
}

}  // namespace

std::string redrawing(const std::string& text, std::size_t rows) {
  // The cursor rests on the last row.
  const std::size_t room = rows > 1 ? rows - 1 : 1;
  const auto lines = static_cast<std::size_t>(std::ranges::count(text, '\n'));
  const std::size_t shown = lines <= room ? lines : room - 1;
  std::string drawing = std::string(home) + cutAtEdge;
  std::size_t at = 0;
  for (std::size_t line = 0; line < shown; ++line) {
    const std::size_t end = text.find('\n', at);
    drawing += text.substr(at, end - at) + clearLine + "\n";
    at = end + 1;
  }
  if (shown < lines) drawing += remainder(lines - shown);
  return drawing + wrapAtEdge + clearBelow;
}

MonitorView::MonitorView() : isTerminal_(::isatty(STDOUT_FILENO) == 1) {}

void MonitorView::show(const std::string& text) {
  if (!isTerminal_) return printOut(text + "---\n");
  const std::string start = isDrawn_ ? "" : clearAll;
  isDrawn_ = true;
  printOut(start + redrawing(text, terminalRows()));
}

}  // namespace kelvasi
