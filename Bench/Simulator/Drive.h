// SPDX-License-Identifier: Apache-2.0
// The simulated drives, message by message as `telvon-sim --write` has them: what the benchmarks' mixtures
// are.
#pragma once

#include <cstddef>
#include <functional>
#include <string>

#include "Bench/LogGenerator/Samples.h"
#include "Simulator/MessageSource.h"

namespace kelvasi::bench {

// Plays the first messages of a technology's usual drive. False from `take` ends it.
void playDrive(const Technology& technology, std::size_t count,
               const std::function<bool(const Bytes& message, sim::WorldTime at)>& take);
// Those messages.
Messages driveOf(const Technology& technology, std::size_t count);

// From where one begins; empty where the message holds none.
std::span<const std::uint8_t> propertyListIn(std::span<const std::uint8_t> message);
// "LTE drive, 13.6 % property lists".
std::string nameOfDrive(const Technology& technology, const Messages& messages);

}  // namespace kelvasi::bench
