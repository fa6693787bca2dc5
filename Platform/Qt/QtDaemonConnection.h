// SPDX-License-Identifier: Apache-2.0
// An application's connection to the daemon's server.
#pragma once

#include <deque>
#include <memory>
#include <optional>
#include <string>

#include "Platform/Qt/FrameChannel.h"
#include "Platform/Qt/LogChannelMessages.h"
#include "Platform/Qt/QtMainQueue.h"

namespace kelvasi {

class QtDaemonConnection : public DaemonConnection {
 public:
  // A connected, non-blocking socket whose peer was checked.
  QtDaemonConnection(FileDescriptor socket, SystemLog& log, std::chrono::milliseconds answerTimeout,
                     TelephonyDaemon::NotificationHandler handler);
  ~QtDaemonConnection() override;

  // Waits no longer than the time-out in all. Notifications that come meanwhile are kept for the event loop.
  LogChannelAnswer createNetworkMonitorLogChannel(std::string_view localPortName) override;

 private:
  bool take(const Frame& frame);
  bool takeAnswer(const Frame& frame);
  bool takeNotification(const Frame& frame);

  std::shared_ptr<FrameChannel> channel_;
  std::chrono::milliseconds answerTimeout_;
  std::shared_ptr<const TelephonyDaemon::NotificationHandler> handler_;
  std::uint32_t token_ = 0;  // of the request last made
  std::optional<LogChannelAnswer> answer_;
  std::size_t waitingNotifications_ = 0;
  QtMainQueue later_;  // drops what is left when the connection is destroyed
};

}  // namespace kelvasi
