// SPDX-License-Identifier: Apache-2.0
// The sending end of somebody's message port.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "Platform/MessagePort.h"
#include "Platform/Qt/FrameChannel.h"

namespace kelvasi {

class QtRemotePort : public RemotePort {
 public:
  // A connected, non-blocking socket whose peer was checked.
  QtRemotePort(FileDescriptor socket, std::string name, SystemLog& log);
  ~QtRemotePort() override;

  bool isValid() const override { return channel_->isPeerThere(); }
  // When the peer has gone, the handler is run by whatever comes first: this call or the event loop.
  void invalidate() override;
  void setInvalidationHandler(InvalidationHandler handler) override { onInvalid_ = std::move(handler); }

  // A message that timed out is not sent; when a part of it had gone already, it is completed later and its
  // reply discarded.
  SendResult sendRequest(MessageId id, std::span<const std::uint8_t> data,
                         std::chrono::milliseconds sendTimeout, std::chrono::milliseconds receiveTimeout,
                         Reply reply) override;

  // The backlog is 8 MiB. That the peer has gone shows with the next write: messages gather until the loop's
  // next turn, or until they are 64 KiB.
  bool sendNow(MessageId id, std::span<const std::uint8_t> data) override;

 private:
  bool take(const Frame& frame);
  std::uint32_t nextToken();
  SendResult awaitReply(std::chrono::milliseconds timeout);
  void tellInvalid();

  std::shared_ptr<FrameChannel> channel_;
  InvalidationHandler onInvalid_;
  std::uint32_t lastToken_ = 0;
  std::uint32_t awaitedToken_ = 0;  // 0 while no reply is awaited
  std::optional<SendResult> answer_;
};

}  // namespace kelvasi
