// SPDX-License-Identifier: Apache-2.0
// The records of the 1x side, encoded from the world.
#pragma once

#include <optional>

#include "Plist/PlistValue.h"
#include "Simulator/C2K/World.h"

namespace kelvasi::sim::c2k {

std::optional<Bytes> deviceStatusRecord(const World& world);      // 0x119C
std::optional<Bytes> systemParametersRecord(const World& world);  // 0x134F; none without a system
std::optional<Bytes> fingersRecord(const World& world);           // 0x108A

// 0x119D: one frame of the traffic channel.
Bytes trafficFrameRecord(bool isError);

}  // namespace kelvasi::sim::c2k
