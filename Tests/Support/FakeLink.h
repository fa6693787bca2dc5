// SPDX-License-Identifier: Apache-2.0
// Message ports and a telephony daemon in memory, for tests of the session: what each step yields is the
// test's to set, and what was asked of it can be looked at.
#pragma once

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "Platform/MessagePort.h"
#include "Platform/TelephonyDaemon.h"

namespace kelvasi::test {

// The part that both kinds of port share. A port may be destroyed by its own handler.
template <typename Interface>
class FakePort : public Interface {
 public:
  explicit FakePort(std::shared_ptr<bool> valid) : valid_(std::move(valid)) {}
  ~FakePort() override { *valid_ = false; }

  bool isValid() const override { return *valid_; }
  void invalidate() override {
    if (std::exchange(*valid_, false) && handler_) std::exchange(handler_, {})();
  }
  void setInvalidationHandler(MessagePort::InvalidationHandler handler) override {
    handler_ = std::move(handler);
  }

 private:
  std::shared_ptr<bool> valid_;
  MessagePort::InvalidationHandler handler_;
};

class FakeLink : public MessagePorts, public TelephonyDaemon {
 public:
  struct Sent {
    MessageId id;
    Bytes data;
    std::chrono::milliseconds sendTimeout;
    std::chrono::milliseconds receiveTimeout;
    RemotePort::Reply reply;
  };

  // What the steps yield.
  std::optional<std::string> identifier = "UUID";
  bool opensLocalPorts = true;
  bool daemonIsThere = true;
  bool daemonRefusesNoName = true;
  LogChannelAnswer answer{.error = {}, .portName = "daemon's port"};
  bool remotePortIsThere = true;
  SendResult technologyResult{.status = SendStatus::success, .reply = std::nullopt};
  SendStatus startStatus = SendStatus::success;

  // What was asked.
  std::vector<std::string> localPortNames;
  std::vector<std::string> channelPortNames;
  std::vector<std::string> remotePortNames;
  std::vector<Sent> sent;

  // The newest ports; false once they are gone.
  std::shared_ptr<bool> localValid = std::make_shared<bool>(false);
  std::shared_ptr<bool> remoteValid = std::make_shared<bool>(false);
  MessagePort* localPort = nullptr;
  MessagePort* remotePort = nullptr;
  std::vector<std::string> invalidated;  // "receive" and "send", in the order in which they were told to
  LocalPort::ReceiveHandler receive;
  NotificationHandler notify;
  int openConnections = 0;
  int connectionsAtRemotePort = -1;  // open ones when the daemon's port was looked for

  std::unique_ptr<LocalPort> createLocalPort(std::string_view name,
                                             LocalPort::ReceiveHandler handler) override {
    localPortNames.emplace_back(name);
    if (!opensLocalPorts) return nullptr;
    receive = std::move(handler);
    localValid = std::make_shared<bool>(true);
    auto port = std::make_unique<Local>(*this);
    localPort = port.get();
    return port;
  }

  std::unique_ptr<RemotePort> createRemotePort(std::string_view name) override {
    remotePortNames.emplace_back(name);
    connectionsAtRemotePort = openConnections;
    if (!remotePortIsThere) return nullptr;
    remoteValid = std::make_shared<bool>(true);
    auto port = std::make_unique<Remote>(*this);
    remotePort = port.get();
    return port;
  }

  std::optional<std::string> makeUniqueIdentifier() override { return identifier; }

  std::unique_ptr<DaemonConnection> connect(NotificationHandler handler) override {
    if (!daemonIsThere) return nullptr;
    notify = std::move(handler);
    return std::make_unique<Connection>(*this);
  }

 private:
  struct Connection : DaemonConnection {
    explicit Connection(FakeLink& itsLink) : link(itsLink) { ++link.openConnections; }
    ~Connection() override { --link.openConnections; }
    LogChannelAnswer createNetworkMonitorLogChannel(std::string_view name) override {
      link.channelPortNames.emplace_back(name);
      if (name.empty() && link.daemonRefusesNoName)
        return {.error = {.domain = 1, .code = 22}, .portName = std::nullopt};
      return link.answer;
    }
    FakeLink& link;
  };

  struct Local : FakePort<LocalPort> {
    explicit Local(FakeLink& itsLink) : FakePort(itsLink.localValid), link(itsLink) {}
    void invalidate() override {
      link.invalidated.emplace_back("receive");
      FakePort::invalidate();
    }
    void setDesertionHandler(DesertionHandler) override {}
    FakeLink& link;
  };

  struct Remote : FakePort<RemotePort> {
    explicit Remote(FakeLink& itsLink) : FakePort(itsLink.remoteValid), link(itsLink) {}
    void invalidate() override {
      link.invalidated.emplace_back("send");
      FakePort::invalidate();
    }
    SendResult sendRequest(MessageId id, std::span<const std::uint8_t> data,
                           std::chrono::milliseconds sendTimeout, std::chrono::milliseconds receiveTimeout,
                           Reply reply) override {
      link.sent.push_back({id, Bytes(data.begin(), data.end()), sendTimeout, receiveTimeout, reply});
      return reply == Reply::awaited ? link.technologyResult
                                     : SendResult{.status = link.startStatus, .reply = std::nullopt};
    }
    bool sendNow(MessageId, std::span<const std::uint8_t>) override { return false; }
    FakeLink& link;
  };
};

}  // namespace kelvasi::test
