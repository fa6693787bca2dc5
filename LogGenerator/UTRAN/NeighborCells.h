// SPDX-License-Identifier: Apache-2.0
// Record 0xD00A: the UTRAN neighbour cells.
#pragma once

#include <array>

#include "LogGenerator/CellFields.h"
#include "LogGenerator/EntryList.h"
#include "LogGenerator/LogCode.h"

namespace kelvasi::utran::neighborCells {

inline constexpr LogCode logCode = 0xD00A;
inline constexpr std::size_t minimumLength = 21;

inline constexpr std::array layout{Field{.name = "cells", .byte = 16, .bit = 1, .width = 7}};

inline constexpr std::array cellLayout{
    Field{.name = "UARFCN", .byte = 0, .bit = 0, .width = 14},
    Field{.name = "cell identity", .byte = 1, .bit = 6, .width = 7},
    Field{.name = "filtered RSCP", .byte = 2, .bit = 5, .width = 8},
    Field{.name = "set membership", .byte = 3, .bit = 5, .width = 2},
    Field{.name = "in the JDCS", .byte = 3, .bit = 7, .width = 1},
};
static_assert(inWireOrder(cellLayout));

inline constexpr CellFields cell{.family = RadioFamily::utraTdd,
                                 .channel = fieldIn(cellLayout, "UARFCN"),
                                 .code = fieldIn(cellLayout, "cell identity")};

inline constexpr EntryList cells{
    .count = fieldIn(layout, "cells"), .start = 168, .stride = 16, .layout = cellLayout};

}  // namespace kelvasi::utran::neighborCells
