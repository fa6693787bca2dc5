// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/SendBuffer.h"

#include <sys/socket.h>

#include <cerrno>

namespace kelvasi {

namespace {

// More than this is not kept for later frames.
constexpr std::size_t keptCapacity = std::size_t{1} << 20;

}  // namespace

void SendBuffer::append(FrameHeader header, std::span<const std::uint8_t> data) {
  header.length = static_cast<std::uint32_t>(data.size());
  if (sent_ > bytes_.size() / 2) dropSent();
  lastFrame_ = bytes_.size();
  const FrameHeaderBytes headerBytes = encodeHeader(header);
  bytes_.insert(bytes_.end(), headerBytes.begin(), headerBytes.end());
  bytes_.insert(bytes_.end(), data.begin(), data.end());
}

bool SendBuffer::withdrawLast() {
  if (lastFrame_ < sent_ || lastFrame_ == bytes_.size()) return false;
  bytes_.resize(lastFrame_);
  return true;
}

SendBuffer::Flushed SendBuffer::flushTo(int socket) {
  while (size() > 0) {
    const ssize_t count = ::send(socket, bytes_.data() + sent_, size(), MSG_NOSIGNAL | MSG_DONTWAIT);
    if (count < 0 && errno == EINTR) continue;
    if (count < 0) return errno == EAGAIN || errno == EWOULDBLOCK ? Flushed::some : Flushed::ended;
    sent_ += static_cast<std::size_t>(count);
  }
  dropSent();
  return Flushed::all;
}

void SendBuffer::dropSent() {
  bytes_.erase(bytes_.begin(), bytes_.begin() + static_cast<std::ptrdiff_t>(sent_));
  lastFrame_ -= std::min(lastFrame_, sent_);
  sent_ = 0;
  if (bytes_.empty() && bytes_.capacity() > keptCapacity) Bytes().swap(bytes_);
}

}  // namespace kelvasi
