// SPDX-License-Identifier: Apache-2.0
// Record 0xB0C1: the antennas of the serving cell.
#pragma once

#include <array>

#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::lte::transmitAntennas {

inline constexpr LogCode logCode = 0xB0C1;
inline constexpr std::size_t minimumLength = 22;

inline constexpr std::array layout{Field{.name = "transmit antennas", .byte = 20}};

}  // namespace kelvasi::lte::transmitAntennas
