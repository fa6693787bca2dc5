#include "Capture/InputBytes.h"

#include <fcntl.h>
#include <sys/types.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <system_error>
#include <utility>

namespace kelvasi {

namespace {

std::string lastError() {
  return std::generic_category().message(errno);
}

int openInput(const std::string& path) {
  if (path == "-") return ::fcntl(STDIN_FILENO, F_DUPFD_CLOEXEC, 0);
  return ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
}

ssize_t readCookie(void* cookie, char* block, std::size_t size) {
  return static_cast<InputBytes*>(cookie)->read({reinterpret_cast<std::uint8_t*>(block), size});
}

// Only "where am I" is answered; there is no going back in a pipe.
int seekCookie(void* cookie, off64_t* offset, int whence) {
  if (whence != SEEK_CUR || *offset != 0) return -1;
  *offset = static_cast<off64_t>(static_cast<InputBytes*>(cookie)->position());
  return 0;
}

}  // namespace

InputBytes::InputBytes(const std::string& path)
    : name_(path == "-" ? "standard input" : path), file_(openInput(path)) {
  if (!file_) fault_ = CaptureFault{name_, std::nullopt, lastError()};
}

std::span<const std::uint8_t> InputBytes::firstBytes(std::size_t count) {
  const std::size_t wanted = std::min(count, first_.size());
  while (firstCount_ < wanted && !endsInFirst_ && !fault_) {
    const auto added = readDescriptor(std::span(first_).first(wanted).subspan(firstCount_));
    if (added < 0) fail(firstCount_, lastError());
    if (added == 0) endsInFirst_ = true;
    if (added > 0) firstCount_ += static_cast<std::size_t>(added);
  }
  return std::span(first_).first(std::min(wanted, firstCount_));
}

std::ptrdiff_t InputBytes::read(std::span<std::uint8_t> block) {
  if (position_ >= firstCount_) {
    const std::ptrdiff_t count = readDescriptor(block);
    if (count > 0) position_ += static_cast<std::uint64_t>(count);
    return count;
  }
  const auto waiting = std::span(first_).first(firstCount_).subspan(static_cast<std::size_t>(position_));
  const auto taken = waiting.first(std::min(waiting.size(), block.size()));
  std::ranges::copy(taken, block.begin());
  position_ += taken.size();
  return static_cast<std::ptrdiff_t>(taken.size());
}

Bytes InputBytes::readToEnd(std::size_t largest, std::string_view kind) {
  Bytes bytes;
  std::array<std::uint8_t, 65536> block;
  std::ptrdiff_t count = 0;
  while (!fault_ && (count = read(block)) > 0) {
    bytes.insert(bytes.end(), block.begin(), block.begin() + count);
    if (bytes.size() > largest) fail(largest, "larger than " + std::string(kind) + " may be here");
  }
  if (count < 0) fail(bytes.size(), lastError());
  if (!fault_ && bytes.empty()) fail(0, "an empty file");
  return bytes;
}

std::ptrdiff_t InputBytes::readDescriptor(std::span<std::uint8_t> block) {
  ssize_t count = -1;
  do {
    count = ::read(file_.number(), block.data(), block.size());
  } while (count < 0 && errno == EINTR);
  return count;
}

void InputBytes::fail(std::uint64_t offset, std::string reason) {
  fault_ = CaptureFault{name_, offset, std::move(reason)};
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
