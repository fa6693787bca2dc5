// The header fields of a log record that no decoder reads, but readers of files do: length and time.
#pragma once

#include "Simulator/Message.h"

namespace kelvasi::sim {

// Sets the record's length, which counts from the length field on, and its time stamp: the moment `at` of a
// world that began on 1 January 2024 UTC, in CDMA system time (3GPP2 C.S0002). Bytes that hold no whole
// record header stay as they are.
void stampRecord(Bytes& record, WorldTime at);

}  // namespace kelvasi::sim
