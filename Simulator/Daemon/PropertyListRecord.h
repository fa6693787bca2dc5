// SPDX-License-Identifier: Apache-2.0
// Extra records of the telephony daemon itself: a header and a property list.
#pragma once

#include <optional>

#include "LogGenerator/LogCode.h"
#include "Platform/PlistSerialiser.h"

namespace kelvasi::sim {

// Nothing when the value cannot be serialised.
std::optional<Bytes> propertyListRecord(LogCode logCode, const PlistValue& value,
                                        const PlistSerialiser& plists);

}  // namespace kelvasi::sim
