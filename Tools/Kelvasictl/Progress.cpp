// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Progress.h"

#include <sys/ioctl.h>
#include <unistd.h>

#include <filesystem>
#include <string_view>
#include <system_error>

namespace kelvasi {

namespace {

using namespace std::chrono_literals;
using Clock = std::chrono::steady_clock;

// What is over before that needs no line.
constexpr auto firstAfter = 300ms;
constexpr auto interval = 200ms;

constexpr std::string_view emptyLine = "\r\x1b[K";

bool isWanted(Progress::Output output) {
  const bool isFree = output == Progress::Output::atTheEnd || ::isatty(STDOUT_FILENO) != 1;
  return isFree && ::isatty(STDERR_FILENO) == 1;
}

// Nothing when one of them is no file.
std::optional<std::uint64_t> sizeOf(const std::vector<std::string>& captures) {
  std::uint64_t size = 0;
  for (const std::string& path : captures) {
    std::error_code error;
    if (!std::filesystem::is_regular_file(path, error)) return std::nullopt;
    const std::uintmax_t added = std::filesystem::file_size(path, error);
    if (!error) size += added;
  }
  return size;
}

std::size_t columns() {
  winsize size{};
  const bool isKnown = ::ioctl(STDERR_FILENO, TIOCGWINSZ, &size) == 0 && size.ws_col > 0;
  return (isKnown ? size.ws_col : 80u) - 1u;
}

// A line that cannot be shown is no reason to stop.
void write(std::string_view text) {
  if (::write(STDERR_FILENO, text.data(), text.size()) < 0) return;
}

}  // namespace

Progress::Progress(const std::vector<std::string>& captures, Output output)
    : isShown_(isWanted(output)), begin_(Clock::now()), next_(begin_ + firstAfter) {
  if (isShown_) figures_.bytesInAll = sizeOf(captures);
}

Progress::~Progress() {
  if (isOnScreen_) write(emptyLine);
}

void Progress::add(std::uint64_t messages, std::uint64_t bytes) {
  if (!isShown_) return;
  const std::lock_guard lock(mutex_);
  figures_.messages += messages;
  figures_.bytes += bytes;
  if (const Time now = Clock::now(); now >= next_) show(now);
}

void Progress::show(Time now) {
  next_ = now + interval;
  figures_.seconds = std::chrono::duration<double>(now - begin_).count();
  write(std::string(emptyLine) + progressText(figures_, columns()));
  isOnScreen_ = true;
}

}  // namespace kelvasi
