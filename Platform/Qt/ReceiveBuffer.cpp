// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/ReceiveBuffer.h"

#include <sys/socket.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <utility>

namespace kelvasi {

namespace {

constexpr std::size_t usualCapacity = std::size_t{256} << 10;

}  // namespace

ReceiveBuffer::Filled ReceiveBuffer::fillFrom(int socket) {
  makeRoom();
  if (end_ == capacity_) return Filled::some;  // frames nobody has taken yet
  ssize_t count = 0;
  do {
    count = ::recv(socket, bytes_.get() + end_, capacity_ - end_, 0);
  } while (count < 0 && errno == EINTR);
  if (count > 0) {
    end_ += static_cast<std::size_t>(count);
    return Filled::some;
  }
  const bool isQuiet = count < 0 && (errno == EAGAIN || errno == EWOULDBLOCK);
  return isQuiet ? Filled::nothing : Filled::ended;
}

std::optional<Frame> ReceiveBuffer::next() {
  const auto bytes = waiting();
  if (fault_ || bytes.size() < frameHeaderSize) return std::nullopt;
  const auto header = bytes.first<frameHeaderSize>();
  fault_ = faultOfHeader(header);
  if (fault_) return std::nullopt;
  Frame frame{.header = decodeHeader(header), .data = {}};
  wanted_ = frameHeaderSize + frame.header.length;
  if (bytes.size() < wanted_) return std::nullopt;
  frame.data = bytes.subspan(frameHeaderSize, frame.header.length);
  begin_ += std::exchange(wanted_, 0);
  return frame;
}

// The buffer grows with what has arrived, not with what a header announces.
void ReceiveBuffer::makeRoom() {
  const std::size_t held = end_ - begin_;
  if (wanted_ > capacity_ && held == capacity_) return moveTo(std::min(wanted_, 2 * capacity_));
  if (capacity_ != usualCapacity && held <= usualCapacity / 2) return moveTo(usualCapacity);
  if (held > 0 && begin_ > 0) std::memmove(bytes_.get(), bytes_.get() + begin_, held);
  begin_ = 0;
  end_ = held;
}

void ReceiveBuffer::moveTo(std::size_t capacity) {
  // NOLINTNEXTLINE(*-avoid-c-arrays): as in the header
  auto bytes = std::make_unique_for_overwrite<std::uint8_t[]>(capacity);
  const auto held = waiting();
  std::ranges::copy(held, bytes.get());
  bytes_ = std::move(bytes);
  capacity_ = capacity;
  begin_ = 0;
  end_ = held.size();
}

}  // namespace kelvasi
