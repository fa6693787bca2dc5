// SPDX-License-Identifier: Apache-2.0
// The daemon's server, for whoever plays the daemon; the bytes are those of Docs/log-channel.md.
#pragma once

#include "Platform/TelephonyDaemon.h"

namespace kelvasi {

class SystemLog;

class QtDaemonServerHost : public DaemonServerHost {
 public:
  // The log outlives every server.
  explicit QtDaemonServerHost(SystemLog& log) : log_(log) {}

  // Clears the runtime directory of the sockets that dead processes left. The handler is called from the
  // event loop and may destroy the server.
  std::unique_ptr<DaemonServer> serve(LogChannelHandler handler) override;

 private:
  SystemLog& log_;
};

}  // namespace kelvasi
