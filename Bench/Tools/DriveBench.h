// SPDX-License-Identifier: Apache-2.0
// What Bench/compare measures of a drive that lies in memory.
#pragma once

#include <string>

namespace kelvasi::bench {

// Prints one JSON line: how many messages and property lists the capture holds, their bytes, and the
// processor seconds (the median of five) that decoding the messages without property lists, copying them, and
// reading the property lists take. False when the capture cannot be read.
bool measureDrive(const std::string& technology, const std::string& capture);

}  // namespace kelvasi::bench
