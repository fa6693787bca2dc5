// SPDX-License-Identifier: Apache-2.0
// Message ports and a daemon's server in memory: both sides of a log channel in one process, deterministic.
// Messages sent without waiting arrive when the main queue runs, as does the news that a sender has gone;
// requests are handed over at once.
#pragma once

#include <deque>
#include <map>
#include <memory>
#include <string>

#include "Platform/MessagePort.h"
#include "Platform/TelephonyDaemon.h"
#include "Tests/Support/FakeMainQueue.h"

namespace kelvasi::test {

class FakePorts : public MessagePorts, public TelephonyDaemon, public DaemonServerHost {
 public:
  // The queue outlives all ports.
  explicit FakePorts(FakeMainQueue& queue) : queue_(queue) {}

  std::unique_ptr<LocalPort> createLocalPort(std::string_view name,
                                             LocalPort::ReceiveHandler handler) override;
  std::unique_ptr<RemotePort> createRemotePort(std::string_view name) override;
  std::optional<std::string> makeUniqueIdentifier() override;

  std::unique_ptr<DaemonConnection> connect(NotificationHandler handler) override;
  std::unique_ptr<DaemonServer> serve(LogChannelHandler handler) override;

  // The owner of this local port takes nothing any more: what is sent to it waits, requests to it time out.
  void stall(const std::string& name);
  void resume(const std::string& name);
  bool isListening(const std::string& name) const { return listeners_.contains(name); }

  std::size_t backlog = 100;  // messages that may wait for a port

 private:
  struct Listener {
    LocalPort::ReceiveHandler handler;
    LocalPort::DesertionHandler onDesertion = {};
    int senders = 0;
    std::deque<std::pair<MessageId, Bytes>> waiting;
    bool isStalled = false;
  };
  class Local;
  class Remote;
  class Connection;
  class Server;

  void removeSender(const std::weak_ptr<Listener>& listener);
  void deliverLater(const std::shared_ptr<Listener>& listener);

  FakeMainQueue& queue_;
  std::map<std::string, std::shared_ptr<Listener>, std::less<>> listeners_;
  std::shared_ptr<LogChannelHandler> server_;
  int identifiers_ = 0;
};

}  // namespace kelvasi::test
