// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/StandardDescriptors.h"

#include <fcntl.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <cstdlib>
#include <utility>

#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

void secureStandardDescriptors() {
  constexpr std::array uses{std::pair{STDIN_FILENO, O_WRONLY}, std::pair{STDOUT_FILENO, O_RDONLY},
                            std::pair{STDERR_FILENO, O_WRONLY}};
  // The lowest free number is taken, so each one lands where it is missing.
  for (const auto& [stream, mode] : uses) {
    if (::fcntl(stream, F_GETFD) < 0 && ::open("/dev/null", mode) != stream) std::abort();
  }
  std::signal(SIGPIPE, SIG_IGN);
  std::signal(SIGXFSZ, SIG_IGN);
}

bool redirectStandardOutput(const std::string& path) {
  const FileDescriptor file(::open(path.c_str(), O_WRONLY | O_CLOEXEC));
  return file && ::dup2(file.number(), STDOUT_FILENO) == STDOUT_FILENO;
}

}  // namespace kelvasi
