// SPDX-License-Identifier: Apache-2.0
// The simulated telephony daemon: opens log channels on request, answers their commands, and sends every
// channel the messages that it subscribed to. An application that does not keep up costs its own messages
// only. Everything runs on the main queue's thread.
#pragma once

#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "Platform/MessagePort.h"
#include "Platform/PlistSerialiser.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyDaemon.h"
#include "Simulator/Channel.h"
#include "Simulator/Commands.h"
#include "Simulator/Faults.h"

namespace kelvasi::sim {

// What the daemon needs of its surroundings; all of it outlives the daemon.
struct DaemonPlatform {
  SystemLog& log;
  MessagePorts& ports;
  const PlistSerialiser& plists;
};

class Daemon {
 public:
  // A channel whose stream has just begun. It is sent messages from then on.
  using StreamHandler = std::function<void(Channel&)>;

  // `technology` is a full id.
  Daemon(const DaemonPlatform& platform, std::string_view technology, Faults faults, StreamHandler onStream);

  // More channels at a time are refused.
  static constexpr std::size_t channelLimit = 64;

  // The daemon's answer to a request for a log channel; nothing when a fault leaves it unanswered.
  std::optional<LogChannelAnswer> openChannel(std::string_view applicationPort);

  bool isStreaming() const;
  std::size_t channelCount() const { return channels_.size(); }

  void send(const Messages& messages);
  // The same, but holds back what an application does not take at once; see flush.
  void sendOrHold(const Messages& messages);
  // Sends what is held back. False while something still is.
  bool flush();
  // Drops what is held back for applications that take nothing any more.
  void giveUp();

  // To be called once a second: closes the channels whose application has closed its port, and writes a line
  // for each that lost messages. One whose application sends no commands any more, having closed its
  // connection, is closed at once.
  void sweep();

 private:
  struct Entry {
    std::unique_ptr<Channel> channel;
    std::unique_ptr<LocalPort> port;  // the daemon's end
  };

  std::optional<Bytes> receive(Channel& channel, MessageId id, std::span<const std::uint8_t> data);
  void start(Channel& channel, Subscription subscription);
  void close(const std::string& name);
  DaemonError addChannel(const std::string& name, std::string_view applicationPort);

  DaemonPlatform platform_;
  std::string technology_;
  Faults faults_;
  StreamHandler onStream_;
  std::map<std::string, Entry, std::less<>> channels_;  // by the name of the daemon's end
};

}  // namespace kelvasi::sim
