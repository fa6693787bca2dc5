// SPDX-License-Identifier: Apache-2.0
// Record 0x7150: a count, then the equivalent PLMNs.
#pragma once

#include <array>

#include "LogGenerator/EntryList.h"
#include "LogGenerator/LogCode.h"

namespace kelvasi::equivalentPlmn {

inline constexpr LogCode logCode = 0x7150;
inline constexpr std::size_t minimumLength = 17;

inline constexpr std::array layout{Field{.name = "count", .byte = 16}};

// An entry is six bytes of one decimal digit each, yet the next entry starts three bytes on: entries overlap.
inline constexpr std::size_t firstEntry = 17;
inline constexpr std::size_t entryStride = 3;
inline constexpr std::array entryLayout{
    Field{.name = "MCC hundreds", .byte = 0}, Field{.name = "MNC hundreds", .byte = 1},
    Field{.name = "MCC tens", .byte = 2},     Field{.name = "MNC tens", .byte = 3},
    Field{.name = "MCC units", .byte = 4},    Field{.name = "MNC units", .byte = 5},
};
static_assert(inWireOrder(entryLayout));
inline constexpr EntryList plmns{
    .count = fieldIn(layout, "count"), .start = firstEntry, .stride = entryStride, .layout = entryLayout};

}  // namespace kelvasi::equivalentPlmn
