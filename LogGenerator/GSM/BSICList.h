// SPDX-License-Identifier: Apache-2.0
// Record 0x51FF: the base-station identity codes (3GPP TS 23.003, 4.3.2) of cells, by ARFCN.
#pragma once

#include <array>

#include "LogGenerator/EntryList.h"
#include "LogGenerator/LogCode.h"

namespace kelvasi::bsicList {

inline constexpr LogCode logCode = 0x51FF;
inline constexpr std::size_t minimumLength = 15;

inline constexpr std::array layout{Field{.name = "cells", .byte = 14}};

inline constexpr std::array cellLayout{
    Field{.name = "ARFCN", .byte = 0, .width = 16},
    Field{.name = "BSIC", .byte = 2},
};
static_assert(inWireOrder(cellLayout));

inline constexpr EntryList cells{
    .count = fieldIn(layout, "cells"), .start = 15, .stride = 4, .layout = cellLayout};

}  // namespace kelvasi::bsicList
