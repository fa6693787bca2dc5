// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/StandardStreams.h"

#include <unistd.h>

#include <cerrno>
#include <string>
#include <system_error>

#include "Platform/Posix/FileDescriptor.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

bool write(int stream, std::string_view text) {
  return writeAll(stream, {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()});
}

}  // namespace

void printOut(std::string_view text) {
  if (write(STDOUT_FILENO, text)) return;
  if (errno == EPIPE) throw OutputClosed();
  throw ToolError("standard output: " + std::generic_category().message(errno));
}

void complain(std::string_view text) {
  // A terminal may have a line there that shows how things stand.
  const std::string begin = ::isatty(STDERR_FILENO) == 1 ? "\r\x1b[K" : "";
  write(STDERR_FILENO, begin + "kelvasictl: " + std::string(text) + "\n");
}

}  // namespace kelvasi
