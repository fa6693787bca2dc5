// SPDX-License-Identifier: Apache-2.0
// The PDP contexts as the telephony daemon lists them.
#pragma once

#include <optional>
#include <vector>

#include "Platform/PlistSerialiser.h"
#include "Simulator/Handset/PacketSwitched.h"

namespace kelvasi::sim::gsm {

// 0xFF0002; nothing when the contexts cannot be serialised.
std::optional<Bytes> pdpContextRecord(const std::vector<PdpContext>& contexts, const PlistSerialiser& plists);

}  // namespace kelvasi::sim::gsm
