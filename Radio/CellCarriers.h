// SPDX-License-Identifier: Apache-2.0
// From a cell's identity to its carriers.
#pragma once

#include <cstdint>
#include <optional>

#include "Radio/Carrier.h"
#include "Radio/CellIdentity.h"

namespace kelvasi {

// By the channel of the identity, which is the downlink's. None where it is not known or means nothing. A
// CDMA channel has one in most band classes.
Carriers carriersOf(const CellIdentity& cell);

// Of a CDMA cell in this band class; of any other cell as above.
Carriers carriersOf(const CellIdentity& cell, std::optional<std::int64_t> bandClass);

}  // namespace kelvasi
