// SPDX-License-Identifier: Apache-2.0
// Message ports as sockets of the runtime directory; the bytes are those of Docs/log-channel.md.
#pragma once

#include "Platform/MessagePort.h"

namespace kelvasi {

class SystemLog;

// Ports of one user; a peer of another user is closed with an error line. A remote port's peer is another
// process, or at least another thread: a request to a port of one's own waits in vain.
class QtMessagePorts : public MessagePorts {
 public:
  // The log outlives every port.
  explicit QtMessagePorts(SystemLog& log) : log_(log) {}

  // Null comes with the reason in the log. Destroying the port is silent, also from within its own handlers.
  std::unique_ptr<LocalPort> createLocalPort(std::string_view name,
                                             LocalPort::ReceiveHandler handler) override;
  // Waits at most 1 s for a listener whose queue of connections is full.
  std::unique_ptr<RemotePort> createRemotePort(std::string_view name) override;
  // In lower case, 36 characters.
  std::optional<std::string> makeUniqueIdentifier() override;

 private:
  SystemLog& log_;
};

}  // namespace kelvasi
