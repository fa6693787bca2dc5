// SPDX-License-Identifier: Apache-2.0
// Record 0xD00E: the GSM neighbour cells.
#pragma once

#include <array>

#include "LogGenerator/ListDecoder.h"

namespace kelvasi::utran::gsmNeighborCells {

inline constexpr LogCode logCode = 0xD00E;
inline constexpr std::size_t minimumLength = 17;

inline constexpr std::array layout{Field{.name = "cells", .byte = 16}};

inline constexpr std::array cellLayout{
    Field{.name = "cell identity", .byte = 0, .bit = 0, .width = 14},
    Field{.name = "band indicator", .byte = 1, .bit = 6, .width = 1},
    Field{.name = "BSIC valid", .byte = 1, .bit = 7, .width = 1},
    Field{.name = "NCC", .byte = 2},
    Field{.name = "BCC", .byte = 3},
    Field{.name = "ARFCN", .byte = 4, .width = 16},
    Field{.name = "RSSI", .byte = 6, .width = 16, .isSigned = true},
};
static_assert(inWireOrder(cellLayout));

inline constexpr EntryList cells{
    .count = fieldIn(layout, "cells"), .start = 17, .stride = 8, .layout = cellLayout};

inline constexpr std::array rows{
    Row{.key = "Cell ID", .quantity = quantity::cellId, .field = indexIn(cellLayout, "cell identity")},
    Row{.key = "Band Indicator", .quantity = quantity::band, .field = indexIn(cellLayout, "band indicator")},
    Row{.key = "BSIC Valid", .quantity = quantity::flag, .field = indexIn(cellLayout, "BSIC valid")},
    Row{.key = "NCC", .quantity = quantity::ncc, .field = indexIn(cellLayout, "NCC")},
    Row{.key = "BCC", .quantity = quantity::bcc, .field = indexIn(cellLayout, "BCC")},
    Row{.key = "ARFCN", .quantity = quantity::arfcn, .field = indexIn(cellLayout, "ARFCN")},
    Row{.key = "RSSI", .quantity = quantity::rssi, .field = indexIn(cellLayout, "RSSI")},
};

}  // namespace kelvasi::utran::gsmNeighborCells
