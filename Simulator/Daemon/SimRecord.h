// The SIM files that the telephony daemon read when the handset was switched on.
#pragma once

#include <optional>
#include <string_view>

#include "Platform/PlistSerialiser.h"

namespace kelvasi::sim::gsm {

// Record 0xFF0000, with the radio technologies that the subscriber may use; nothing when the files cannot be
// serialised.
std::optional<Bytes> simFilesRecord(const PlistSerialiser& plists,
                                    std::string_view technologies = "GSM and UMTS");

}  // namespace kelvasi::sim::gsm
