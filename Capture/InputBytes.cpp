// SPDX-License-Identifier: Apache-2.0
#include "Capture/InputBytes.h"

#include <sys/types.h>

#include <array>
#include <cerrno>
#include <utility>

namespace kelvasi {

namespace {

ssize_t readCookie(void* cookie, char* block, std::size_t size) {
  const std::ptrdiff_t count =
      static_cast<InputBytes*>(cookie)->read({reinterpret_cast<std::uint8_t*>(block), size});
  if (count < 0) errno = EIO;
  return count;
}

// Only "where am I" is answered; there is no going back in a pipe.
int seekCookie(void* cookie, off64_t* offset, int whence) {
  if (whence != SEEK_CUR || *offset != 0) return -1;
  *offset = static_cast<off64_t>(static_cast<InputBytes*>(cookie)->position());
  return 0;
}

}  // namespace

InputBytes::InputBytes(const std::string& path) : file_(path), fileFirst_(file_) {
  constexpr std::size_t longestMagic = 4;
  auto unpacker = unpackerFor(fileFirst_.firstBytes(longestMagic));
  if (!unpacker) return;
  unpacked_.emplace(fileFirst_, file_.name(), std::move(unpacker));
  unpackedFirst_.emplace(*unpacked_);
}

std::string InputBytes::name() const {
  return unpacked_ ? file_.name() + ", unpacked" : file_.name();
}

Bytes InputBytes::readToEnd(std::size_t largest, std::string_view kind) {
  Bytes bytes;
  std::array<std::uint8_t, 65536> block;
  std::ptrdiff_t count = 0;
  while (!fault() && (count = read(block)) > 0) {
    bytes.insert(bytes.end(), block.begin(), block.begin() + count);
    if (bytes.size() > largest) fail(largest, "larger than " + std::string(kind) + " may be here");
  }
  if (!fault() && bytes.empty()) fail(0, "an empty file");
  return bytes;
}

void InputBytes::fail(std::uint64_t offset, std::string reason) {
  fault_ = CaptureFault{name(), offset, std::move(reason)};
}

std::unique_ptr<std::FILE, InputBytes::Close> InputBytes::stream() {
  const cookie_io_functions_t functions{
      .read = readCookie, .write = nullptr, .seek = seekCookie, .close = nullptr};
  constexpr std::size_t bufferSize = 1 << 18;
  std::unique_ptr<std::FILE, Close> stream(::fopencookie(this, "r", functions));
  if (stream) std::setvbuf(stream.get(), nullptr, _IOFBF, bufferSize);
  return stream;
}

}  // namespace kelvasi
