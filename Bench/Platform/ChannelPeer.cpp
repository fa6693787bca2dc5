// SPDX-License-Identifier: Apache-2.0
#include "Bench/Platform/ChannelPeer.h"

#include <charconv>
#include <iostream>

#include "Bench/Simulator/Drive.h"
#include "Bench/Support/Surroundings.h"
#include "Platform/Qt/QtDaemonServerHost.h"
#include "Platform/Qt/QtEventLoop.h"
#include "Platform/Qt/QtMainQueue.h"
#include "Platform/Qt/QtMessagePorts.h"

namespace kelvasi::bench {

namespace {

using namespace std::chrono_literals;

constexpr MessageId logMessageId = 0;
constexpr std::size_t messageKinds = 256;

class Peer {
 public:
  bool open() {
    port_ = ports_.createLocalPort(peerPortName, [this](MessageId id, std::span<const std::uint8_t> data) {
      if (id == burstRequest) send(data);
      return id == burstRequest ? std::nullopt : technology_;
    });
    server_ = host_.serve([this](std::string_view name) { return openChannel(name); });
    return port_ && server_;
  }

  void serve() { loop_.runFor(60s); }

 private:
  LogChannelAnswer openChannel(std::string_view name) {
    target_ = ports_.createRemotePort(name);
    if (!target_) return {.error = {.domain = 1, .code = 1}, .portName = {}};
    target_->setInvalidationHandler([this] { loop_.quit(); });
    return {.error = {}, .portName = std::string(peerPortName)};
  }

  void send(std::span<const std::uint8_t> count) {
    const std::string digits(count.begin(), count.end());
    std::from_chars(digits.data(), digits.data() + digits.size(), left_);
    sendMore();
  }

  // As much as the port takes; the rest once some of it has gone.
  void sendMore() {
    while (left_ > 0 && target_ && target_->sendNow(logMessageId, messages_[left_ % messages_.size()]))
      --left_;
    if (left_ > 0) queue_.postAfter(1ms, [this] { sendMore(); });
  }

  Surroundings surroundings_;
  QtEventLoop loop_;
  QtMainQueue queue_;
  QtMessagePorts ports_{surroundings_.log};
  QtDaemonServerHost host_{surroundings_.log};
  Messages messages_ = channelMessages();
  std::optional<Bytes> technology_ = surroundings_.plists.serialiseXml(
      PlistDictionary::make({{"GetTechnology", technologies().front().id}}));
  std::unique_ptr<LocalPort> port_;
  std::unique_ptr<DaemonServer> server_;
  std::unique_ptr<RemotePort> target_;
  std::size_t left_ = 0;
};

}  // namespace

Messages channelMessages() {
  Messages messages = driveOf(technologies().front(), messageKinds);
  std::erase_if(messages, [](const Bytes& message) { return message.size() > channelMessageSize; });
  for (Bytes& message : messages) message.resize(channelMessageSize);
  return messages;
}

int runChannelPeer() {
  Peer peer;
  if (!peer.open()) return 1;
  std::cout << '.' << std::flush;
  peer.serve();
  return 0;
}

}  // namespace kelvasi::bench
