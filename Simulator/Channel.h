// SPDX-License-Identifier: Apache-2.0
// One application's log channel, seen from the daemon: what it subscribed to, and the way to its port.
#pragma once

#include <cstdint>
#include <deque>
#include <memory>
#include <optional>
#include <span>
#include <string>

#include "Platform/MessagePort.h"
#include "Simulator/Message.h"
#include "Simulator/Subscription.h"

namespace kelvasi::sim {

class Channel {
 public:
  // `name` is that of the daemon's end; the application listens at the other.
  Channel(std::string name, std::unique_ptr<RemotePort> application);

  const std::string& name() const { return name_; }
  // False once the application has gone.
  bool isValid() const { return application_->isValid(); }

  void start(Subscription subscription) { subscription_ = std::move(subscription); }
  void stop() { subscription_.reset(); }
  bool isStreaming() const { return subscription_.has_value(); }

  // Sends a message that the application wants; when it does not keep up, the message is dropped and counted.
  void send(const Message& message);
  // The same, but keeps the message until a later flush instead of dropping it.
  void sendOrHold(const Message& message);
  // Sends what is held, as far as the application takes it. Whether that was anything.
  bool flush();
  bool isHolding() const { return !held_.empty(); }
  // Drops what is held. Until the application takes something again, sendOrHold drops as well.
  void giveUp();

  // Messages dropped since the last call.
  std::uint64_t takeDropped();

 private:
  bool handOver(const Message& message);

  std::string name_;
  std::unique_ptr<RemotePort> application_;
  std::optional<Subscription> subscription_;
  std::deque<Message> held_;
  bool isStalled_ = false;
  std::uint64_t dropped_ = 0;
};

}  // namespace kelvasi::sim
