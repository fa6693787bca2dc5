// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/EndingSignals.h"

namespace kelvasi {

namespace {

// Asked for by nohup(1). Held back it would arrive all the same.
bool isHangUpIgnored() {
  struct sigaction action {};
  return ::sigaction(SIGHUP, nullptr, &action) == 0 && action.sa_handler == SIG_IGN;
}

}  // namespace

sigset_t endingSignals() {
  sigset_t ending;
  ::sigemptyset(&ending);
  ::sigaddset(&ending, SIGINT);
  ::sigaddset(&ending, SIGTERM);
  if (!isHangUpIgnored()) ::sigaddset(&ending, SIGHUP);
  return ending;
}

}  // namespace kelvasi
