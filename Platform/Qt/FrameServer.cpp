// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/FrameServer.h"

#include "Platform/SystemLog.h"

namespace kelvasi {

std::unique_ptr<FrameServer> FrameServer::open(std::string_view name, SystemLog& log, FrameHandler onFrame) {
  std::unique_ptr<FrameServer> server(new FrameServer(name, log, std::move(onFrame)));
  return server->listener_ ? std::move(server) : nullptr;
}

FrameServer::FrameServer(std::string_view name, SystemLog& log, FrameHandler onFrame)
    : name_(name),
      log_(log),
      onFrame_(std::make_shared<const FrameHandler>(std::move(onFrame))),
      listener_(ListeningSocket::open(name, log, [this](FileDescriptor socket) { add(std::move(socket)); })) {
}

FrameServer::~FrameServer() {
  for (const auto& channel : channels_) channel->close();
}

void FrameServer::postToAll(const FrameHeader& header, std::span<const std::uint8_t> data) {
  for (const auto& channel : channels_) channel->post(header, data);
}

// The handlers hold what they need through the server's end: it may come from within them.
void FrameServer::add(FileDescriptor socket) {
  if (channels_.size() >= connectionLimit) {
    log_.print(LogPriority::error, "%s: more than %zu connections; connection closed", name_.c_str(),
               connectionLimit);
    return;
  }
  const auto channel = std::make_shared<FrameChannel>(std::move(socket), name_, log_);
  FrameChannel* const self = channel.get();
  channels_.push_back(channel);
  channel->start(
      [onFrame = onFrame_, self](const Frame& frame) { return (*onFrame)(*self, frame); },
      [this, self] { std::erase_if(channels_, [self](const auto& one) { return one.get() == self; }); });
}

}  // namespace kelvasi
