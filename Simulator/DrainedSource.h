// SPDX-License-Identifier: Apache-2.0
// Takes a source's messages as fast as they can be made, without waiting for their times.
#pragma once

#include <functional>

#include "Simulator/Faults.h"
#include "Simulator/MessageSource.h"

namespace kelvasi::sim {

// Takes a message and its time in the source's world. False when it wants no more.
using MessageTaker = std::function<bool(const Message& message, WorldTime at)>;

// Hands over the first `count` messages of a stream that begins now: the present state, and then what
// follows. Messages whose id is none of the log channel's are left out. How many were taken: fewer than
// `count` where the source has ended or `take` wants no more.
std::uint64_t drain(MessageSource& source, const Faults& faults, std::uint64_t count,
                    const MessageTaker& take);

}  // namespace kelvasi::sim
