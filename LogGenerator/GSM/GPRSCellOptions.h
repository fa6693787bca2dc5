// SPDX-License-Identifier: Apache-2.0
// Record 0x51F6: the GPRS cell options (3GPP TS 44.060, 12.24). Two sections show the DRX timer of it.
#pragma once

#include <array>

#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::gprsCellOptions {

inline constexpr LogCode logCode = 0x51F6;
inline constexpr std::size_t minimumLength = 24;

inline constexpr std::array layout{
    Field{.name = "T3192", .byte = 15},
    Field{.name = "DRX timer maximum", .byte = 16},
    Field{.name = "access burst type", .byte = 17},
};
static_assert(inWireOrder(layout));

}  // namespace kelvasi::gprsCellOptions
