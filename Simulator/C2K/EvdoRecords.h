// SPDX-License-Identifier: Apache-2.0
// The records of the EV-DO side, encoded from the world.
#pragma once

#include <optional>

#include "Plist/PlistValue.h"
#include "Simulator/C2K/World.h"

namespace kelvasi::sim::c2k {

std::optional<Bytes> evdoStatusRecord(const World& world);     // 0x1183
std::optional<Bytes> evdoActiveSetRecord(const World& world);  // 0x12B6
// As of the last whole second; none while EV-DO is inactive.
std::optional<Bytes> forwardRateRecord(const World& world);  // 0x1192
std::optional<Bytes> reverseRateRecord(const World& world);  // 0x127E

}  // namespace kelvasi::sim::c2k
