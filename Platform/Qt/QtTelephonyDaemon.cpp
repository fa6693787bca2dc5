// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtTelephonyDaemon.h"

#include "Platform/Qt/QtDaemonConnection.h"
#include "Platform/Qt/UnixSocket.h"

namespace kelvasi {

std::unique_ptr<DaemonConnection> QtTelephonyDaemon::connect(NotificationHandler handler) {
  FileDescriptor socket = connectToName(daemonServerName, log_);
  if (!socket) return nullptr;
  return std::make_unique<QtDaemonConnection>(std::move(socket), log_, answerTimeout_, std::move(handler));
}

}  // namespace kelvasi
