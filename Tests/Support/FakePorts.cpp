// SPDX-License-Identifier: Apache-2.0
#include "Tests/Support/FakePorts.h"

#include <utility>

namespace kelvasi::test {

namespace {
constexpr DaemonError timedOut{.domain = 1, .code = 110};
}

class FakePorts::Local : public LocalPort {
 public:
  Local(FakePorts& ports, std::string name) : ports_(ports), name_(std::move(name)) {}
  ~Local() override { close(); }

  bool isValid() const override { return isOpen_; }
  void invalidate() override {
    if (close() && handler_) std::exchange(handler_, {})();
  }
  void setInvalidationHandler(InvalidationHandler handler) override { handler_ = std::move(handler); }
  void setDesertionHandler(DesertionHandler handler) override {
    ports_.listeners_.at(name_)->onDesertion = std::move(handler);
  }

 private:
  bool close() {
    if (isOpen_) ports_.listeners_.erase(name_);
    return std::exchange(isOpen_, false);
  }

  FakePorts& ports_;
  std::string name_;
  bool isOpen_ = true;
  InvalidationHandler handler_;
};

class FakePorts::Remote : public RemotePort {
 public:
  Remote(FakePorts& ports, const std::shared_ptr<Listener>& listener) : ports_(ports), listener_(listener) {}
  ~Remote() override { hangUp(); }

  bool isValid() const override { return isOpen_ && !listener_.expired(); }
  void invalidate() override {
    hangUp();
    if (std::exchange(isOpen_, false) && handler_) std::exchange(handler_, {})();
  }
  void setInvalidationHandler(InvalidationHandler handler) override { handler_ = std::move(handler); }

  SendResult sendRequest(MessageId id, std::span<const std::uint8_t> data, std::chrono::milliseconds,
                         std::chrono::milliseconds, Reply reply) override {
    const auto listener = listener_.lock();
    if (!isOpen_ || !listener) return {SendStatus::invalid, std::nullopt};
    speak(*listener);
    if (listener->isStalled)
      return {reply == Reply::awaited ? SendStatus::receiveTimeout : SendStatus::success, std::nullopt};
    auto answer = listener->handler(id, data);
    if (reply == Reply::none) answer.reset();
    return {SendStatus::success, std::move(answer)};
  }

  bool sendNow(MessageId id, std::span<const std::uint8_t> data) override {
    const auto listener = listener_.lock();
    if (!isOpen_ || !listener || listener->waiting.size() >= ports_.backlog) return false;
    speak(*listener);
    listener->waiting.emplace_back(id, Bytes(data.begin(), data.end()));
    ports_.deliverLater(listener);
    return true;
  }

 private:
  void speak(Listener& listener) {
    if (!std::exchange(hasSpoken_, true)) ++listener.senders;
  }
  void hangUp() {
    if (std::exchange(hasSpoken_, false)) ports_.removeSender(listener_);
  }

  FakePorts& ports_;
  std::weak_ptr<Listener> listener_;
  bool isOpen_ = true;
  bool hasSpoken_ = false;
  InvalidationHandler handler_;
};

class FakePorts::Connection : public DaemonConnection {
 public:
  explicit Connection(std::weak_ptr<LogChannelHandler> server) : server_(std::move(server)) {}

  LogChannelAnswer createNetworkMonitorLogChannel(std::string_view localPortName) override {
    const auto server = server_.lock();
    const auto answer = server ? (*server)(localPortName) : std::nullopt;
    return answer.value_or(LogChannelAnswer{.error = timedOut, .portName = std::nullopt});
  }

 private:
  std::weak_ptr<LogChannelHandler> server_;
};

class FakePorts::Server : public DaemonServer {
 public:
  explicit Server(FakePorts& ports) : ports_(ports) {}
  ~Server() override { ports_.server_.reset(); }
  void notify(std::string_view) override {}

 private:
  FakePorts& ports_;
};

std::unique_ptr<LocalPort> FakePorts::createLocalPort(std::string_view name,
                                                      LocalPort::ReceiveHandler handler) {
  const auto [place, isNew] = listeners_.emplace(name, nullptr);
  if (!isNew) return nullptr;
  place->second = std::make_shared<Listener>(Listener{.handler = std::move(handler), .waiting = {}});
  return std::make_unique<Local>(*this, std::string(name));
}

std::unique_ptr<RemotePort> FakePorts::createRemotePort(std::string_view name) {
  const auto listener = listeners_.find(name);
  if (listener == listeners_.end()) return nullptr;
  return std::make_unique<Remote>(*this, listener->second);
}

std::optional<std::string> FakePorts::makeUniqueIdentifier() {
  return "uuid-" + std::to_string(++identifiers_);
}

std::unique_ptr<DaemonConnection> FakePorts::connect(NotificationHandler) {
  return server_ ? std::make_unique<Connection>(server_) : nullptr;
}

std::unique_ptr<DaemonServer> FakePorts::serve(LogChannelHandler handler) {
  if (server_) return nullptr;
  server_ = std::make_shared<LogChannelHandler>(std::move(handler));
  return std::make_unique<Server>(*this);
}

void FakePorts::stall(const std::string& name) {
  listeners_.at(name)->isStalled = true;
}

void FakePorts::resume(const std::string& name) {
  const auto& listener = listeners_.at(name);
  listener->isStalled = false;
  for (std::size_t count = listener->waiting.size(); count > 0; --count) deliverLater(listener);
}

void FakePorts::removeSender(const std::weak_ptr<Listener>& listener) {
  queue_.post([listener] {
    const auto from = listener.lock();
    if (!from || --from->senders > 0) return;
    const auto handler = from->onDesertion;
    if (handler) handler();
  });
}

void FakePorts::deliverLater(const std::shared_ptr<Listener>& listener) {
  queue_.post([weak = std::weak_ptr(listener)] {
    const auto to = weak.lock();
    if (!to || to->isStalled || to->waiting.empty()) return;
    const auto [id, data] = std::move(to->waiting.front());
    to->waiting.pop_front();
    to->handler(id, data);
  });
}

}  // namespace kelvasi::test
