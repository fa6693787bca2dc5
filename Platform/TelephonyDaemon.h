// SPDX-License-Identifier: Apache-2.0
// The telephony daemon: its server seen from an application, and the server itself for whoever plays the
// daemon.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace kelvasi {

struct DaemonError {
  std::int32_t domain = 0;
  std::int32_t code = 0;  // 0 is success
};

struct LogChannelAnswer {
  DaemonError error;
  std::optional<std::string> portName;  // the daemon's end of the channel
};

// An open connection to the daemon's server; destroying it closes it.
class DaemonConnection {
 public:
  virtual ~DaemonConnection() = default;

  // Asks for a network-monitor log channel whose messages shall go to the local port of this name. Waits for
  // the answer a bounded time; a daemon that does not answer or goes away yields a non-zero code.
  virtual LogChannelAnswer createNetworkMonitorLogChannel(std::string_view localPortName) = 0;
};

class TelephonyDaemon {
 public:
  // Something the daemon tells an application that is connected.
  using NotificationHandler = std::function<void(std::string_view notification)>;

  virtual ~TelephonyDaemon() = default;

  // Null when no daemon answers.
  virtual std::unique_ptr<DaemonConnection> connect(NotificationHandler handler) = 0;
};

// The daemon's side. Destroying it closes the server.
class DaemonServer {
 public:
  virtual ~DaemonServer() = default;

  // Tells every application that is connected, without waiting; one that leaves too much unread misses it.
  virtual void notify(std::string_view notification) = 0;
};

class DaemonServerHost {
 public:
  // Answers one request for a log channel to the named local port of an application. Nothing means that the
  // request stays unanswered.
  using LogChannelHandler = std::function<std::optional<LogChannelAnswer>(std::string_view localPortName)>;

  virtual ~DaemonServerHost() = default;

  // Null, with the reason in the system log, when the server cannot be opened or another daemon is there
  // already.
  virtual std::unique_ptr<DaemonServer> serve(LogChannelHandler handler) = 0;
};

}  // namespace kelvasi
