// SPDX-License-Identifier: Apache-2.0
// The last words of a process that ends by an uncaught exception.
#pragma once

#include <string>

#include "Platform/SystemLog.h"

namespace kelvasi {

// From now on std::terminate writes the reason to `log` at critical priority, as in "Terminating: uncaught
// kelvasi::ArrayOutOfBoundsException: <what it says>", and aborts (SIGABRT). With the name of a program, for
// where `log` goes elsewhere, it is also one line on the standard error, after that name. `log` must outlive
// the process's last exception.
void installTerminateHandler(SystemLog& log, const std::string& program = {});

}  // namespace kelvasi
