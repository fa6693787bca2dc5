// SPDX-License-Identifier: Apache-2.0
// Record 0x51F8: the hopping sequence number and the frequencies of the mobile allocation (3GPP TS 45.002,
// 6.2.2).
#pragma once

#include <array>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::hoppingList {

inline constexpr LogCode logCode = 0x51F8;
inline constexpr std::size_t minimumLength = 15;

inline constexpr std::array layout{
    Field{.name = "hopping sequence number", .byte = 13},
    Field{.name = "ARFCNs", .byte = 14},
};
static_assert(inWireOrder(layout));

inline constexpr std::array frequencyLayout{Field{.name = "ARFCN", .byte = 0, .width = 16}};
inline constexpr EntryList frequencies{
    .count = fieldIn(layout, "ARFCNs"), .start = 15, .stride = 2, .layout = frequencyLayout};

inline constexpr std::array rows{
    Row{.key = "HSN",
        .quantity = quantity::hoppingSequence,
        .field = indexIn(layout, "hopping sequence number")},
};

inline constexpr Row frequencyRow{
    .key = "ARFCNs", .quantity = quantity::arfcn, .field = indexIn(frequencyLayout, "ARFCN")};

inline constexpr std::array columns{
    ListColumn{.key = frequencyRow.key, .list = frequencies, .element = &frequencyRow}};
inline constexpr RecordRows record{
    .logCode = logCode, .minimumLength = minimumLength, .layout = layout, .rows = rows, .lists = columns};

}  // namespace kelvasi::hoppingList
