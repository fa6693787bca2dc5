// SPDX-License-Identifier: Apache-2.0
// The header fields of a log record that no decoder reads, but readers of files do: length and time.
#pragma once

#include "Simulator/Message.h"

namespace kelvasi::sim {

// When every world began, 1 January 2024 UTC, since 1970.
inline constexpr std::chrono::seconds worldEpoch{1704067200};

// Sets the record's length, which counts from the length field on, and its time stamp: the world's moment
// `at`, in CDMA system time (3GPP2 C.S0002). Bytes that hold no whole record header stay as they are.
void stampRecord(Bytes& record, WorldTime at);

}  // namespace kelvasi::sim
