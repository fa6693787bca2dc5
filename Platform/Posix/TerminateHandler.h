// The last words of a process that ends by an uncaught exception.
#pragma once

#include "Platform/SystemLog.h"

namespace kelvasi {

// From now on std::terminate writes the reason to `log` at critical priority, as in "Terminating: uncaught
// kelvasi::ArrayOutOfBoundsException: <what it says>", and aborts (SIGABRT). `log` must outlive the process's
// last exception.
void installTerminateHandler(SystemLog& log);

}  // namespace kelvasi
