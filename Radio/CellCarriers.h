// SPDX-License-Identifier: Apache-2.0
// From a cell's identity to its carriers.
#pragma once

#include "Radio/Carrier.h"
#include "Radio/CellIdentity.h"

namespace kelvasi {

// By the channel of the identity, which is the downlink's. None where it is not known or means nothing. A
// CDMA channel has one in most band classes; where the class is known, cdmaCarriers() chooses.
Carriers carriersOf(const CellIdentity& cell);

}  // namespace kelvasi
