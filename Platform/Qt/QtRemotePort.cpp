// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtRemotePort.h"

#include <utility>

namespace kelvasi {

namespace {

using Outcome = FrameChannel::Outcome;

FrameChannel::Deadline after(std::chrono::milliseconds time) {
  return std::chrono::steady_clock::now() + time;
}

}  // namespace

QtRemotePort::QtRemotePort(FileDescriptor socket, std::string name, SystemLog& log)
    : channel_(std::make_shared<FrameChannel>(std::move(socket), std::move(name), log)) {
  channel_->start([this](const Frame& frame) { return take(frame); }, [this] { tellInvalid(); });
}

QtRemotePort::~QtRemotePort() {
  channel_->close();
}

void QtRemotePort::invalidate() {
  if (!channel_->isOpen()) return;
  channel_->close();
  tellInvalid();
}

SendResult QtRemotePort::sendRequest(MessageId id, std::span<const std::uint8_t> data,
                                     std::chrono::milliseconds sendTimeout,
                                     std::chrono::milliseconds receiveTimeout, Reply reply) {
  if (data.size() > maximumFrameData || !isValid()) return {SendStatus::invalid, std::nullopt};
  const bool isAwaited = reply == Reply::awaited;
  awaitedToken_ = isAwaited ? nextToken() : 0;
  const FrameHeader header{
      .kind = isAwaited ? FrameKind::request : FrameKind::message, .id = id, .token = awaitedToken_};
  const Outcome sent = channel_->sendBy(after(sendTimeout), header, data);
  SendResult result{SendStatus::success, std::nullopt};
  if (sent == Outcome::timedOut) result.status = SendStatus::sendTimeout;
  if (sent == Outcome::ended) result.status = SendStatus::becameInvalid;
  if (sent == Outcome::done && isAwaited) result = awaitReply(receiveTimeout);
  awaitedToken_ = 0;
  return result;
}

bool QtRemotePort::sendNow(MessageId id, std::span<const std::uint8_t> data) {
  return channel_->post({.kind = FrameKind::message, .id = id}, data);
}

SendResult QtRemotePort::awaitReply(std::chrono::milliseconds timeout) {
  answer_.reset();
  const Outcome received = channel_->receiveBy(after(timeout), [this] { return answer_.has_value(); });
  if (received == Outcome::done) return *std::exchange(answer_, {});
  return {received == Outcome::timedOut ? SendStatus::receiveTimeout : SendStatus::becameInvalid,
          std::nullopt};
}

// Only the awaited reply counts; one that comes too late bears a token that nobody awaits any more.
bool QtRemotePort::take(const Frame& frame) {
  const bool hasData = frame.header.kind == FrameKind::reply;
  const bool isEmpty = frame.header.kind == FrameKind::emptyReply && frame.data.empty();
  if (!hasData && !isEmpty) return false;
  if (awaitedToken_ == 0 || frame.header.token != awaitedToken_ || answer_) return true;
  answer_.emplace(SendResult{SendStatus::success, std::nullopt});
  if (hasData) answer_->reply.emplace(frame.data.begin(), frame.data.end());
  return true;
}

std::uint32_t QtRemotePort::nextToken() {
  if (++lastToken_ == 0) ++lastToken_;
  return lastToken_;
}

// The handler may destroy the port.
void QtRemotePort::tellInvalid() {
  const InvalidationHandler handler = std::exchange(onInvalid_, {});
  if (handler) handler();
}

}  // namespace kelvasi
