// The SIM files that the telephony daemon read when the handset was switched on.
#pragma once

#include <optional>

#include "Platform/PlistSerialiser.h"

namespace kelvasi::sim::gsm {

// Record 0xFF0000; nothing when the files cannot be serialised.
std::optional<Bytes> simFilesRecord(const PlistSerialiser& plists);

}  // namespace kelvasi::sim::gsm
