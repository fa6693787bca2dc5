// SPDX-License-Identifier: Apache-2.0
// The signals that end a program well.
#pragma once

#include <csignal>

namespace kelvasi {

// SIGINT, SIGTERM and, unless it is ignored, SIGHUP.
sigset_t endingSignals();

}  // namespace kelvasi
