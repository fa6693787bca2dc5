// SPDX-License-Identifier: Apache-2.0
#include "Platform/Terminal/CursesLibrary.h"

#include <fcntl.h>
#include <poll.h>
#include <pthread.h>
#include <sys/ioctl.h>
#include <sys/signalfd.h>
#include <term.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <stdexcept>

namespace kelvasi::terminal {

namespace {

std::string environment(const char* name) {
  const char* const value = std::getenv(name);
  return value ? value : "";
}

bool describes(const std::string& type) {
  int error = 0;
  return ::setupterm(type.c_str(), STDOUT_FILENO, &error) == OK;
}

// Terminals that take any colour say so in COLORTERM, while TERM names their 256; the database has a
// description of the same with direct colours where it is installed whole.
std::string typeOfTerminal() {
  std::string type = environment("TERM");
  const std::string colours = environment("COLORTERM");
  if (colours != "truecolor" && colours != "24bit") return type;
  const std::string direct = type.substr(0, type.find("-256color")) + "-direct";
  return type.find("direct") == std::string::npos && describes(direct) ? direct : type;
}

std::string capability(const char* name) {
  const char* const text = ::tigetstr(name);
  return text && text != reinterpret_cast<const char*>(-1) ? text : "";  // -1: no capability of this kind
}

// Pen, keypad, cursor and screen as they were; and no more reports of the mouse.
std::string leaving() {
  return capability("sgr0") + capability("op") + capability("rmkx") + capability("cnorm") +
         capability("rmcup") + (capability("kmous").empty() ? "" : "\x1b[?1000l\x1b[?1006l");
}

attr_t withoutColour(Role role) {
  switch (role) {
    case Role::stale:
    case Role::line:
      return A_DIM;
    case Role::accent:
    case Role::poor:
      return A_BOLD;
    default:
      return A_NORMAL;
  }
}

int colourFor(Colour colour, Role role, int colours) {
  if (colours < 256) return nearestOf8(role);
  if (!colour) return -1;
  return colours > 256 ? static_cast<int>(*colour) : nearestOf256(*colour);
}

}  // namespace

std::string whyNoTerminal() {
  if (::isatty(STDOUT_FILENO) != 1)
    return "the standard output is no terminal; monitor and decode print into files";
  const std::string type = environment("TERM");
  if (type.empty()) return "TERM is not set, so what the terminal can do is not known";
  if (!describes(type)) return "TERM is \"" + type + "\", which is not in the database of terminals";
  if (capability("cup").empty())
    return "a terminal \"" + type + "\" cannot move its cursor; monitor prints line by line";
  return {};
}

CursesTerminal::Library::Library(CharacterSet characters, const Theme& theme) {
  if (const std::string why = whyNoTerminal(); !why.empty()) throw std::runtime_error(why);
  if (::isatty(STDIN_FILENO) != 1) ownInput_ = FileDescriptor(::open("/dev/tty", O_RDONLY | O_CLOEXEC));
  input_ = ownInput_ ? ownInput_.number() : STDIN_FILENO;
  if (::tcgetattr(STDOUT_FILENO, &before_) != 0) throw std::runtime_error("the terminal has gone");
  (void)characters;
  begin(typeOfTerminal());
  prepareColours(theme);
  holdSignals();
  restore_.emplace(STDOUT_FILENO, before_, leaving());
}

void CursesTerminal::Library::begin(const std::string& type) {
  ::use_env(FALSE);
  ::use_tioctl(TRUE);
  // A second stream on the terminal: the library closes neither.
  std::FILE* const in = ownInput_ ? ::fdopen(input_, "r") : stdin;
  screen_ = ::newterm(type.c_str(), stdout, in);
  if (!screen_) throw std::runtime_error("the terminal \"" + type + "\" cannot be used");
  ::set_escdelay(25);
  ::cbreak();
  ::noecho();
  ::nonl();
  ::keypad(stdscr, TRUE);
  ::nodelay(stdscr, TRUE);
  ::meta(stdscr, TRUE);
  ::curs_set(0);
  ::leaveok(stdscr, FALSE);
  ::mousemask(BUTTON1_PRESSED | BUTTON4_PRESSED | BUTTON5_PRESSED, nullptr);
  ::mouseinterval(0);
}

void CursesTerminal::Library::prepareColours(const Theme& theme) {
  const bool isWanted = environment("NO_COLOR").empty() && environment("TERM") != "dumb";
  hasColours_ = isWanted && ::has_colors() && ::start_color() == OK && COLORS >= 8;
  for (std::size_t at = 0; at < roles; ++at) {
    const Role role = static_cast<Role>(at);
    styles_[at].attributes = hasColours_ && COLORS >= 256 ? A_NORMAL : withoutColour(role);
    if (!hasColours_) continue;
    ::use_default_colors();
    const int ground = theme.ground && COLORS >= 256 ? colourFor(theme.ground, role, COLORS) : -1;
    styles_[at].pair = static_cast<int>(at) + 1;
    ::init_extended_pair(styles_[at].pair, colourFor(theme.of(role), role, COLORS), ground);
  }
  if (hasColours_) ::bkgd(static_cast<chtype>(COLOR_PAIR(styles_[0].pair)));
}

// One that is ignored stays so: a shell without job control does that.
void CursesTerminal::Library::holdSignals() {
  struct sigaction stop {};
  ::sigaction(SIGTSTP, nullptr, &stop);
  canStop_ = stop.sa_handler != SIG_IGN;
  ::sigemptyset(&held_);
  ::sigaddset(&held_, SIGWINCH);
  if (canStop_) {
    ::signal(SIGTSTP, SIG_DFL);  // in place of the library's
    ::sigaddset(&held_, SIGTSTP);
  }
  ::pthread_sigmask(SIG_BLOCK, &held_, &maskBefore_);
  signals_ = FileDescriptor(::signalfd(-1, &held_, SFD_NONBLOCK | SFD_CLOEXEC));
}

CursesTerminal::Library::~Library() {
  ::endwin();
  restore_.reset();
  ::delscreen(screen_);
  ::pthread_sigmask(SIG_SETMASK, &maskBefore_, nullptr);
}

bool CursesTerminal::Library::isBusy() const {
  int waiting = 0;
  pollfd out{.fd = STDOUT_FILENO, .events = POLLOUT, .revents = 0};
  const bool isFull = ::poll(&out, 1, 0) == 0;
  return isFull || (::ioctl(STDOUT_FILENO, TIOCOUTQ, &waiting) == 0 && waiting > 0);
}

void CursesTerminal::Library::takeSize() {
  winsize size{};
  if (::ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) != 0 || size.ws_row == 0 || size.ws_col == 0) return;
  if (size.ws_row != LINES || size.ws_col != COLS) ::resizeterm(size.ws_row, size.ws_col);
}

void CursesTerminal::Library::suspend() {
  ::def_prog_mode();
  ::endwin();
  restore_.reset();
  sigset_t stop;
  ::sigemptyset(&stop);
  ::sigaddset(&stop, SIGTSTP);
  ::raise(SIGTSTP);
  ::pthread_sigmask(SIG_UNBLOCK, &stop, nullptr);  // the process stops here
  ::pthread_sigmask(SIG_BLOCK, &stop, nullptr);
  restore_.emplace(STDOUT_FILENO, before_, leaving());
  ::reset_prog_mode();
  takeSize();
  ::clearok(::curscr, TRUE);
  ::refresh();
  ::keypad(::stdscr,
           TRUE);  // ncurses says it to the terminal with the next key only, and an arrow may be that one
}

void CursesTerminal::Library::write(const std::string& bytes) const {
  writeAll(STDOUT_FILENO, {reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size()});
}

}  // namespace kelvasi::terminal
