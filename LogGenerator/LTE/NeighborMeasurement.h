// SPDX-License-Identifier: Apache-2.0
// Record 0xB180: the neighbour cells measured on one frequency in idle mode.
#pragma once

#include <array>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::lte::neighborMeasurement {

inline constexpr LogCode logCode = 0xB180;
inline constexpr std::size_t minimumLength = 21;

inline constexpr std::array layout{
    Field{.name = "version", .byte = 13},
    Field{.name = "E-ARFCN", .byte = 17, .bit = 0, .width = 16},
    Field{.name = "Qrxlevmin", .byte = 19, .bit = 0, .width = 6},
    Field{.name = "neighbours minus 1", .byte = 19, .bit = 6, .width = 5},
};
static_assert(inWireOrder(layout));

inline constexpr std::array neighborLayout{
    Field{.name = "physical cell identity", .byte = 0, .bit = 0, .width = 9},
    Field{.name = "measured RSSI", .byte = 1, .bit = 1, .width = 8},
    Field{.name = "measured RSRP", .byte = 2, .bit = 1, .width = 9},
    Field{.name = "average RSRP", .byte = 4, .bit = 0, .width = 9},
    Field{.name = "measured RSRQ", .byte = 5, .bit = 1, .width = 7},
    Field{.name = "average RSRQ", .byte = 6, .bit = 0, .width = 7},
    Field{.name = "Srxlev", .byte = 6, .bit = 7, .width = 7},
    Field{.name = "frequency offset", .byte = 8, .bit = 0, .width = 16},
    Field{.name = "frame offset", .byte = 12, .bit = 0, .width = 11},
    Field{.name = "sample offset", .byte = 13, .bit = 3, .width = 19},
};
static_assert(inWireOrder(neighborLayout));

inline constexpr CellFields neighborCell{.family = RadioFamily::lte,
                                         .code = fieldIn(neighborLayout, "physical cell identity"),
                                         .headChannel = fieldIn(layout, "E-ARFCN")};

// The count leaves out one cell, so the list is never empty.
inline constexpr EntryList neighbors{.count = fieldIn(layout, "neighbours minus 1"),
                                     .uncounted = 1,
                                     .start = 21,
                                     .stride = 20,
                                     .layout = neighborLayout};

// What the neighbours have in common.
inline constexpr std::array rows{
    Row{.key = "Version", .quantity = quantity::version, .field = indexIn(layout, "version")},
    Row{.key = "E-ARFCN", .quantity = quantity::earfcn, .field = indexIn(layout, "E-ARFCN")},
    Row{.key = "Qrxlevmin",
        .quantity = quantity::qrxlevmin,
        .field = indexIn(layout, "Qrxlevmin"),
        .unit = " dBm",
        .factor = 2,
        .offset = -140},
};
inline constexpr RecordRows record{logCode, minimumLength, layout, rows};

}  // namespace kelvasi::lte::neighborMeasurement
