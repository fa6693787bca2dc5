// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/StandardStreams.h"

#include <fcntl.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <string>
#include <system_error>
#include <utility>

#include "Platform/Posix/FileDescriptor.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

bool write(int stream, std::string_view text) {
  return writeAll(stream, {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()});
}

}  // namespace

void secureStandardStreams() {
  constexpr std::array uses{std::pair{STDIN_FILENO, O_WRONLY}, std::pair{STDOUT_FILENO, O_RDONLY},
                            std::pair{STDERR_FILENO, O_WRONLY}};
  // The lowest free number is taken, so each one lands where it is missing.
  for (const auto& [stream, mode] : uses) {
    if (::fcntl(stream, F_GETFD) < 0 && ::open("/dev/null", mode) != stream) std::abort();
  }
  std::signal(SIGPIPE, SIG_IGN);
  std::signal(SIGXFSZ, SIG_IGN);
}

void printOut(std::string_view text) {
  if (!write(STDOUT_FILENO, text))
    throw ToolError("standard output: " + std::generic_category().message(errno));
}

void complain(std::string_view text) {
  // A terminal may have a line there that shows how things stand.
  const std::string begin = ::isatty(STDERR_FILENO) == 1 ? "\r\x1b[K" : "";
  write(STDERR_FILENO, begin + "kelvasictl: " + std::string(text) + "\n");
}

}  // namespace kelvasi
