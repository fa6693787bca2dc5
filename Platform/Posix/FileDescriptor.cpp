#include "Platform/Posix/FileDescriptor.h"

#include <unistd.h>

#include <cerrno>
#include <cstddef>
#include <utility>

namespace kelvasi {

bool FileDescriptor::close() {
  // Not retried after a signal: Linux has closed it by then.
  const int number = std::exchange(number_, -1);
  return number < 0 || ::close(number) == 0 || errno == EINTR;
}

bool writeAll(int descriptor, std::span<const std::uint8_t> bytes) {
  while (!bytes.empty()) {
    const ssize_t count = ::write(descriptor, bytes.data(), bytes.size());
    if (count > 0) bytes = bytes.subspan(static_cast<std::size_t>(count));
    if (count < 0 && errno != EINTR) return false;
  }
  return true;
}

}  // namespace kelvasi
