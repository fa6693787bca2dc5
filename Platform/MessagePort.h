// SPDX-License-Identifier: Apache-2.0
// Named message ports between processes of one user. All handlers run on the main queue's thread.
#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

using MessageId = std::uint32_t;

class MessagePort {
 public:
  using InvalidationHandler = std::function<void()>;

  virtual ~MessagePort() = default;

  // False once the port was invalidated or, for a remote port, once the peer has gone.
  virtual bool isValid() const = 0;
  // Closes the port. When it was valid and a handler is set, the handler is run, once, from within this call.
  virtual void invalidate() = 0;
  // An empty handler removes the one that is set.
  virtual void setInvalidationHandler(InvalidationHandler handler) = 0;
};

// The receiving end, known to others by its name.
class LocalPort : public MessagePort {
 public:
  // Given a message's id and data, which last for the call only; returns the reply's data, or nothing for no
  // reply. A sender that does not wait for a reply is sent none.
  using ReceiveHandler =
      std::function<std::optional<Bytes>(MessageId id, std::span<const std::uint8_t> data)>;
  using DesertionHandler = std::function<void()>;

  // Run when the last of those who had sent something has closed its connection. It may destroy the port.
  virtual void setDesertionHandler(DesertionHandler handler) = 0;
};

// Status of a request; the numbers are what log lines print.
enum class SendStatus : int {
  success = 0,
  sendTimeout = -1,     // the message could not be handed over in time
  receiveTimeout = -2,  // no reply in time
  invalid = -3,         // the port is no longer valid, or the message is larger than a frame may be
  becameInvalid = -5,   // the peer went while its reply was awaited
};

struct SendResult {
  SendStatus status = SendStatus::invalid;
  std::optional<Bytes> reply;  // only when one was awaited and the peer gave one
};

// The sending end of somebody's local port.
class RemotePort : public MessagePort {
 public:
  enum class Reply { none, awaited };

  // Hands one message over, waiting at most `sendTimeout`, then for the reply, where one is awaited, at most
  // `receiveTimeout`. No other handler runs while it waits.
  virtual SendResult sendRequest(MessageId id, std::span<const std::uint8_t> data,
                                 std::chrono::milliseconds sendTimeout,
                                 std::chrono::milliseconds receiveTimeout, Reply reply) = 0;

  // Puts one message on its way without waiting. False, and the message is dropped, when the port is not
  // valid or more than the port's backlog is still waiting for the peer.
  virtual bool sendNow(MessageId id, std::span<const std::uint8_t> data) = 0;
};

class MessagePorts {
 public:
  virtual ~MessagePorts() = default;

  // Null when the name is taken or not usable.
  virtual std::unique_ptr<LocalPort> createLocalPort(std::string_view name,
                                                     LocalPort::ReceiveHandler handler) = 0;
  // Null when nobody listens under the name.
  virtual std::unique_ptr<RemotePort> createRemotePort(std::string_view name) = 0;
  // A fresh UUID in its textual form; nothing when none could be made.
  virtual std::optional<std::string> makeUniqueIdentifier() = 0;
};

}  // namespace kelvasi
