// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/FileDescriptor.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>

namespace kelvasi {

FileDescriptor& FileDescriptor::operator=(FileDescriptor&& other) noexcept {
  if (this == &other) return *this;
  close();
  number_ = std::exchange(other.number_, -1);
  return *this;
}

bool FileDescriptor::close() {
  // Not retried after a signal: Linux has closed it by then.
  const int number = std::exchange(number_, -1);
  return number < 0 || ::close(number) == 0 || errno == EINTR;
}

namespace {

// How many bytes went through; fewer than all, with errno set, on failure.
std::size_t writeWhatGoes(int descriptor, std::span<const std::uint8_t> bytes) {
  std::size_t written = 0;
  while (written < bytes.size()) {
    const ssize_t count = ::write(descriptor, bytes.data() + written, bytes.size() - written);
    if (count > 0) written += static_cast<std::size_t>(count);
    if (count < 0 && errno != EINTR) break;
  }
  return written;
}

// Best effort: a pipe cannot be cut.
void takeBack(int descriptor, std::size_t count) {
  struct stat status {};
  const off_t end = ::lseek(descriptor, 0, SEEK_CUR);
  if (::fstat(descriptor, &status) != 0 || !S_ISREG(status.st_mode) || status.st_size != end) return;
  const off_t before = end - static_cast<off_t>(count);
  if (::ftruncate(descriptor, before) == 0) ::lseek(descriptor, before, SEEK_SET);
}

}  // namespace

bool writeAll(int descriptor, std::span<const std::uint8_t> bytes) {
  return writeWhatGoes(descriptor, bytes) == bytes.size();
}

bool writeWhole(int descriptor, std::span<const std::uint8_t> bytes) {
  const std::size_t written = writeWhatGoes(descriptor, bytes);
  if (written == bytes.size()) return true;
  const int reason = errno;
  if (written > 0) takeBack(descriptor, written);
  errno = reason;
  return false;
}

}  // namespace kelvasi
