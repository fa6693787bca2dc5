// SPDX-License-Identifier: Apache-2.0
// The records of GSM radio resources. Each is nothing while there is nothing to tell.
#pragma once

#include <optional>

#include "Plist/PlistValue.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::gsm {

std::optional<Bytes> rrStateRecord(const World& world);           // 0x512C
std::optional<Bytes> gsmCellIdentityRecord(const World& world);   // 0x5134
std::optional<Bytes> bsicListRecord(const World& world);          // 0x51FF
std::optional<Bytes> gsmMeasurementsRecord(const World& world);   // 0x5137
std::optional<Bytes> dedicatedChannelRecord(const World& world);  // 0x5076
std::optional<Bytes> mobileAllocationRecord(const World& world);  // 0x51F8
std::optional<Bytes> dtxRecord(const World& world);               // 0x5072

}  // namespace kelvasi::sim::gsm
