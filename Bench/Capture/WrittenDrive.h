// SPDX-License-Identifier: Apache-2.0
// Captures for the benchmarks, made in the build directory.
#pragma once

#include <string>

#include "Bench/LogGenerator/Samples.h"

namespace kelvasi::bench {

// The path of a pcap file with this many messages of the technology's drive. Throws std::runtime_error when
// it cannot be written.
std::string writeDrive(const Technology& technology, std::size_t count);

}  // namespace kelvasi::bench
