// SPDX-License-Identifier: Apache-2.0
// Record 0x5137: measurements of the GSM serving cell and its neighbours. Four sections read it, two of them
// the same two words as different things.
#pragma once

#include <array>

#include "LogGenerator/CellFields.h"
#include "LogGenerator/LogCode.h"

namespace kelvasi::gsmMeasurements {

inline constexpr LogCode logCode = 0x5137;
inline constexpr std::size_t minimumLength = 29;

inline constexpr std::array layout{
    Field{.name = "receive level", .byte = 15},
    Field{.name = "C1 or full receive quality", .byte = 16, .width = 32},
    Field{.name = "C2 or sub receive quality", .byte = 20, .width = 32},
    Field{.name = "reselect hysteresis", .byte = 26},
    Field{.name = "neighbours", .byte = 28},
};
static_assert(inWireOrder(layout));

inline constexpr std::array neighbourLayout{
    Field{.name = "ARFCN", .byte = 0, .width = 16},
    Field{.name = "RSSI", .byte = 2},
    Field{.name = "C1", .byte = 3, .width = 32},
};
static_assert(inWireOrder(neighbourLayout));

inline constexpr EntryList neighbours{
    .count = fieldIn(layout, "neighbours"), .start = 29, .stride = 14, .layout = neighbourLayout};

// The record says nothing of the serving cell but what it is not.
inline constexpr CellFields servingCell{.family = RadioFamily::gsm,
                                        .isServing = true,
                                        .others = neighbours,
                                        .otherChannel = fieldIn(neighbourLayout, "ARFCN")};

}  // namespace kelvasi::gsmMeasurements
