// SPDX-License-Identifier: Apache-2.0
#include "Platform/Terminal/CursesTerminal.h"

#include <langinfo.h>
#include <poll.h>
#include <sys/signalfd.h>
#include <unistd.h>

#include <clocale>
#include <cstdio>
#include <string_view>

#include "Platform/Terminal/CursesLibrary.h"
#include "Plist/Encoding.h"

namespace kelvasi::terminal {

namespace {

using Kind = Key::Kind;

struct NamedKey {
  wint_t code;
  Kind kind;
};

constexpr std::array functionKeys{
    NamedKey{KEY_UP, Kind::up},
    NamedKey{KEY_DOWN, Kind::down},
    NamedKey{KEY_LEFT, Kind::left},
    NamedKey{KEY_RIGHT, Kind::right},
    NamedKey{KEY_PPAGE, Kind::pageUp},
    NamedKey{KEY_NPAGE, Kind::pageDown},
    NamedKey{KEY_HOME, Kind::home},
    NamedKey{KEY_END, Kind::end},
    NamedKey{KEY_ENTER, Kind::enter},
    NamedKey{KEY_BTAB, Kind::backTab},
    NamedKey{KEY_BACKSPACE, Kind::backspace},
    NamedKey{KEY_DC, Kind::remove},
};
constexpr std::array characters{
    NamedKey{'\r', Kind::enter},  NamedKey{'\n', Kind::enter},     NamedKey{0x1B, Kind::escape},
    NamedKey{'\t', Kind::tab},    NamedKey{0x7F, Kind::backspace}, NamedKey{0x08, Kind::backspace},
    NamedKey{0x0C, Kind::redraw},
};

std::optional<Key> mouseKey() {
  MEVENT event;
  if (::getmouse(&event) != OK) return std::nullopt;
  const Place place{event.x, event.y};
  if (event.bstate & BUTTON4_PRESSED) return Key{.kind = Kind::wheelUp, .place = place};
  if (event.bstate & BUTTON5_PRESSED) return Key{.kind = Kind::wheelDown, .place = place};
  if (event.bstate & BUTTON1_PRESSED) return Key{.kind = Kind::press, .place = place};
  return std::nullopt;
}

template <typename Table>
std::optional<Key> keyIn(const Table& table, wint_t code) {
  for (const NamedKey& key : table)
    if (key.code == code) return Key{.kind = key.kind};
  return std::nullopt;
}

std::optional<Key> characterKey(wint_t code) {
  if (auto key = keyIn(characters, code)) return key;
  if (code < 0x20) return std::nullopt;
  return Key{.kind = Kind::character, .character = static_cast<char32_t>(code)};
}

void put(Place place, const Cell& cell, const CursesStyle& style) {
  std::array<wchar_t, 4> text{};
  for (std::size_t at = 0; at < cell.glyph.points.size(); ++at)
    text[at] = static_cast<wchar_t>(cell.glyph.points[at]);
  attr_t attributes = style.attributes;
  if (cell.style.isBold) attributes |= A_BOLD;
  if (cell.style.isReversed) attributes |= A_REVERSE;
  cchar_t character{};
  int pair = style.pair;
  ::setcchar(&character, text.data(), attributes, 0, &pair);
  ::mvadd_wch(place.row, place.column, &character);
}

}  // namespace

CharacterSet charactersOfLocale() {
  const char* const before = std::setlocale(LC_CTYPE, nullptr);
  const std::string kept = before ? before : "C";
  std::setlocale(LC_CTYPE, "");
  const bool isUtf8 = std::string_view(::nl_langinfo(CODESET)) == "UTF-8";
  std::setlocale(LC_CTYPE, kept.c_str());
  return isUtf8 ? CharacterSet::utf8 : CharacterSet::ascii;
}

CursesTerminal::CursesTerminal(CharacterSet itsCharacters, const Theme& theme) : characters_(itsCharacters) {
  // Widths and what the library sends follow the locale; nothing else does.
  if (characters_ == CharacterSet::utf8 && !std::setlocale(LC_CTYPE, "")) std::setlocale(LC_CTYPE, "C.UTF-8");
  library_ = std::make_unique<Library>(characters_, theme);
}

CursesTerminal::~CursesTerminal() = default;

int CursesTerminal::input() const {
  return library_->input();
}

int CursesTerminal::signalDescriptor() const {
  return library_->signalDescriptor();
}

bool CursesTerminal::hasColours() const {
  return library_->hasColours();
}

Size CursesTerminal::size() const {
  return {getmaxx(stdscr), getmaxy(stdscr)};
}

void CursesTerminal::takeSignals() {
  signalfd_siginfo info;
  while (::read(library_->signalDescriptor(), &info, sizeof info) == sizeof info) {
    if (info.ssi_signo == SIGTSTP) library_->suspend();
    library_->takeSize();
  }
}

// Rows that are as they were are not touched. While the line is busy it goes on with what it has; the next
// show() makes up for it.
void CursesTerminal::show(const Grid& grid, std::optional<Place> cursor) {
  if (library_->isBusy()) return;
  const bool isAnew = !shown_ || shown_->size() != grid.size();
  if (isAnew) ::erase();
  for (int row = 0; row < grid.size().rows; ++row) {
    if (!isAnew && rowsAreEqual(*shown_, grid, row)) continue;
    for (int column = 0; column < grid.size().columns; ++column) {
      const Cell& cell = grid.at({column, row});
      if (!cell.isTail) put({column, row}, cell, library_->styleOf(cell.style.role));
    }
  }
  shown_ = grid;
  ::curs_set(cursor ? 1 : 0);
  if (cursor) ::move(cursor->row, cursor->column);
  ::refresh();
}

std::optional<Key> CursesTerminal::next() {
  wint_t code = 0;
  for (;;) {
    const int status = ::get_wch(&code);
    if (status == ERR) return std::nullopt;
    const auto key = status != KEY_CODE_YES ? characterKey(code)
                     : code == KEY_MOUSE    ? mouseKey()
                                            : keyIn(functionKeys, code);
    if (key) return key;
  }
}

bool CursesTerminal::isThere() const {
  pollfd in{.fd = library_->input(), .events = POLLIN, .revents = 0};
  return ::poll(&in, 1, 0) <= 0 || (in.revents & (POLLHUP | POLLERR | POLLNVAL)) == 0;
}

void CursesTerminal::redraw() {
  shown_.reset();
  ::clearok(::curscr, TRUE);
}

bool CursesTerminal::copy(std::string_view text) {
  if (text.size() > mostCopied) return false;
  library_->write("\x1b]52;c;" + base64(Bytes(text.begin(), text.end())) + "\a");
  return true;
}

}  // namespace kelvasi::terminal
