// When a message came in: the time stamp of its capture, or the clock at that moment.
#pragma once

#include <chrono>

namespace kelvasi {

using Arrival = std::chrono::nanoseconds;  // since 1 January 1970 UTC

}  // namespace kelvasi
