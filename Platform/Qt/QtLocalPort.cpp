// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtLocalPort.h"

#include <utility>

#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

void answer(FrameChannel& channel, std::uint32_t token, const std::optional<Bytes>& reply, SystemLog& log) {
  const bool isTooLarge = reply && reply->size() > maximumFrameData;
  if (isTooLarge) log.print(LogPriority::error, "A reply of %zu bytes is too large to send", reply->size());
  const bool hasData = reply && !isTooLarge;
  const FrameHeader header{.kind = hasData ? FrameKind::reply : FrameKind::emptyReply, .token = token};
  if (!channel.post(header, hasData ? std::span(*reply) : std::span<const std::uint8_t>()))
    channel.fail("peer leaves its replies unread");
}

bool receive(const LocalPort::ReceiveHandler& handler, SystemLog& log, FrameChannel& from,
             const Frame& frame) {
  const bool isRequest = frame.header.kind == FrameKind::request;
  if (!isRequest && frame.header.kind != FrameKind::message) return false;
  const std::optional<Bytes> reply = handler(frame.header.id, frame.data);
  if (isRequest) answer(from, frame.header.token, reply, log);
  return true;
}

}  // namespace

std::unique_ptr<QtLocalPort> QtLocalPort::open(std::string_view name, SystemLog& log,
                                               ReceiveHandler handler) {
  auto server = FrameServer::open(
      name, log, [handler = std::move(handler), &log](FrameChannel& from, const Frame& frame) {
        return receive(handler, log, from, frame);
      });
  if (!server) return nullptr;
  return std::unique_ptr<QtLocalPort>(new QtLocalPort(std::move(server)));
}

void QtLocalPort::setDesertionHandler(DesertionHandler handler) {
  if (server_) server_->setDesertionHandler(std::move(handler));
}

// The handler may destroy the port.
void QtLocalPort::invalidate() {
  if (!server_) return;
  server_.reset();
  const InvalidationHandler handler = std::exchange(onInvalid_, {});
  if (handler) handler();
}

}  // namespace kelvasi
