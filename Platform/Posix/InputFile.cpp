// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/InputFile.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>

#include "Platform/Posix/PrivateFiles.h"

namespace kelvasi {

namespace {

std::error_code lastError() {
  return {errno, std::generic_category()};
}

FileDescriptor openInput(const std::string& path) {
  if (path == "-") return FileDescriptor(::fcntl(STDIN_FILENO, F_DUPFD_CLOEXEC, 0));
  return openFile(path, O_RDONLY);
}

}  // namespace

InputFile::InputFile(const std::string& path)
    : name_(path == "-" ? "standard input" : path), file_(openInput(path)) {
  if (!file_) error_ = lastError();
}

std::ptrdiff_t InputFile::read(std::span<std::uint8_t> block) {
  if (error_) return -1;
  ssize_t count = -1;
  do {
    count = ::read(file_.number(), block.data(), block.size());
  } while (count < 0 && errno == EINTR);
  if (count < 0) error_ = lastError();
  if (count > 0) position_ += static_cast<std::uint64_t>(count);
  return count;
}

}  // namespace kelvasi
