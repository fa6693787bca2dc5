// SPDX-License-Identifier: Apache-2.0
// What a GSM cell broadcasts of its packet service. Each is nothing while GSM does not serve.
#pragma once

#include <optional>

#include "Plist/PlistValue.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::gsm {

std::optional<Bytes> si13Record(const World& world);             // 0x51F4
std::optional<Bytes> packetAccessRecord(const World& world);     // 0x51F5
std::optional<Bytes> gprsCellOptionsRecord(const World& world);  // 0x51F6
std::optional<Bytes> pbcchRecord(const World& world);            // 0x51FB
std::optional<Bytes> packetStatusRecord(const World& world);     // 0x51FD

}  // namespace kelvasi::sim::gsm
