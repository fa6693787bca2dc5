// SPDX-License-Identifier: Apache-2.0
// The far end of the measured log channel: a telephony daemon that sends as many messages as it is told to.
#pragma once

#include <string_view>

#include "Bench/LogGenerator/Samples.h"
#include "Platform/MessagePort.h"

namespace kelvasi::bench {

inline constexpr std::string_view peerPortName = "bench.daemon";
// A message of this id to the peer's port holds, as decimal digits, how many log messages it shall send.
inline constexpr MessageId burstRequest = 1;
inline constexpr std::size_t channelMessageSize = 100;  // bytes

// What it sends, over and over: records of the first technology, filled up with zeros.
Messages channelMessages();

// Serves until the channel's other end has gone, one minute at most; tells by a byte on the standard output
// that it can be reached. Returns the exit status.
int runChannelPeer();

}  // namespace kelvasi::bench
