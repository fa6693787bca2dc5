// SPDX-License-Identifier: Apache-2.0
// Record 0xD0E2: the serving cell.
#pragma once

#include <array>

#include "LogGenerator/CellFields.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::utran::servingCell {

inline constexpr LogCode logCode = 0xD0E2;
inline constexpr std::size_t minimumLength = 26;

inline constexpr std::array layout{
    Field{.name = "cell access restrictions", .byte = 14},
    Field{.name = "URA identity", .byte = 15},
    Field{.name = "uplink UARFCN", .byte = 17, .width = 16},
    Field{.name = "downlink UARFCN", .byte = 19, .width = 16},
    Field{.name = "cell identity", .byte = 21, .width = 32, .isSigned = true},
    Field{.name = "emergency calls only", .byte = 25, .bit = 0, .width = 1},
};
static_assert(inWireOrder(layout));

inline constexpr CellFields cell{.family = RadioFamily::utraTdd,
                                 .channel = fieldIn(layout, "downlink UARFCN"),
                                 .cellId = fieldIn(layout, "cell identity"),
                                 .isServing = true};

}  // namespace kelvasi::utran::servingCell
