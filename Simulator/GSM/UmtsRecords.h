// SPDX-License-Identifier: Apache-2.0
// The records of UMTS radio resource control and of its transport channels.
#pragma once

#include <optional>

#include "Plist/PlistValue.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::gsm {

// Each is nothing while there is nothing to tell.
std::optional<Bytes> rrcStateRecord(const World& world);         // 0x4125
std::optional<Bytes> transmitPowerRecord(const World& world);    // 0x4031
std::optional<Bytes> umtsServingCellRecord(const World& world);  // 0x4127
std::optional<Bytes> cipheringRecord(const World& world);        // 0x4157
std::optional<Bytes> hsdpaRecord(const World& world);            // 0x4221
std::optional<Bytes> blockErrorRecord(const World& world);       // 0x4116

}  // namespace kelvasi::sim::gsm
