// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/FrameServer.h"

#include <algorithm>

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
  channel->start([onFrame = onFrame_, self](const Frame& frame) { return (*onFrame)(*self, frame); },
                 [this, self] { remove(*self); }, [this] { boundHeld(); });
}

void FrameServer::remove(const FrameChannel& ended) {
  const bool hadSpoken = ended.hasSpoken();
  std::erase_if(channels_, [&ended](const auto& one) { return one.get() == &ended; });
  const bool isDeserted = std::ranges::none_of(channels_, [](const auto& one) { return one->hasSpoken(); });
  const DesertionHandler handler = onDesertion_;
  if (hadSpoken && isDeserted && handler) handler();
}

void FrameServer::boundHeld() {
  const auto held = [](const auto& channel) { return channel->held(); };
  const auto total = [&] {
    std::size_t sum = 0;
    for (const auto& channel : channels_) sum += held(channel);
    return sum;
  };
  while (total() > heldLimit)
    (*std::ranges::max_element(channels_, {}, held))
        ->fail("all connections hold more than 64 MiB, this one most");
}

}  // namespace kelvasi
