// SPDX-License-Identifier: Apache-2.0
// The telephony daemon's server as an application sees it; the bytes are those of Docs/log-channel.md.
#pragma once

#include <chrono>

#include "Platform/TelephonyDaemon.h"

namespace kelvasi {

class SystemLog;

// Domain of the errors that an application finds itself: the codes are errno values of POSIX.
//   ETIMEDOUT   no answer in time
//   ECONNRESET  the daemon closed the connection instead of answering
//   EPROTO      what came is not an answer
inline constexpr std::int32_t posixErrorDomain = 1;

class QtTelephonyDaemon : public TelephonyDaemon {
 public:
  static constexpr std::chrono::milliseconds usualAnswerTimeout{1000};

  // The log outlives every connection. `answerTimeout` bounds a request for a log channel and its answer.
  explicit QtTelephonyDaemon(SystemLog& log, std::chrono::milliseconds answerTimeout = usualAnswerTimeout)
      : log_(log), answerTimeout_(answerTimeout) {}

  // Waits at most 1 s for a daemon whose queue of connections is full. The handler is called from the event
  // loop, and not after the connection was destroyed, which it may do itself.
  std::unique_ptr<DaemonConnection> connect(NotificationHandler handler) override;

 private:
  SystemLog& log_;
  std::chrono::milliseconds answerTimeout_;
};

}  // namespace kelvasi
