// SPDX-License-Identifier: Apache-2.0
#include "Capture/FileBytes.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <system_error>

#include "Platform/Posix/PrivateFiles.h"

namespace kelvasi {

namespace {

std::string lastError() {
  return std::generic_category().message(errno);
}

FileDescriptor openInput(const std::string& path) {
  if (path == "-") return FileDescriptor(::fcntl(STDIN_FILENO, F_DUPFD_CLOEXEC, 0));
  return openFile(path, O_RDONLY);
}

}  // namespace

FileBytes::FileBytes(const std::string& path)
    : name_(path == "-" ? "standard input" : path), file_(openInput(path)) {
  if (!file_) fault_ = CaptureFault{name_, std::nullopt, lastError()};
}

std::ptrdiff_t FileBytes::read(std::span<std::uint8_t> block) {
  if (fault_) return -1;
  ssize_t count = -1;
  do {
    count = ::read(file_.number(), block.data(), block.size());
  } while (count < 0 && errno == EINTR);
  if (count < 0) fault_ = CaptureFault{name_, position_, lastError()};
  if (count > 0) position_ += static_cast<std::uint64_t>(count);
  return count;
}

}  // namespace kelvasi
