// SPDX-License-Identifier: Apache-2.0
// Record 0x4116: CRCs of each transport channel, received and received in error, over a window.
#pragma once

#include <array>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::transportChannelCrc {

inline constexpr LogCode logCode = 0x4116;
inline constexpr std::size_t minimumLength = 16;

inline constexpr std::array layout{
    Field{.name = "transport channels", .byte = 13},
    Field{.name = "window size", .byte = 14, .width = 16},
};
static_assert(inWireOrder(layout));

inline constexpr std::array channelLayout{
    Field{.name = "transport channel", .byte = 0},
    Field{.name = "CRCs received", .byte = 1, .width = 32},
    Field{.name = "CRCs in error", .byte = 5, .width = 32},
};
static_assert(inWireOrder(channelLayout));

inline constexpr EntryList channels{
    .count = fieldIn(layout, "transport channels"), .start = 16, .stride = 9, .layout = channelLayout};

inline constexpr std::array rows{
    Row{.key = "Window Size", .quantity = quantity::window, .field = indexIn(layout, "window size")},
};
inline constexpr std::array channelRows{
    Row{.key = "Transport Channel ID",
        .quantity = quantity::channelId,
        .field = indexIn(channelLayout, "transport channel")},
    Row{.key = "CRC Received", .quantity = quantity::crcs, .field = indexIn(channelLayout, "CRCs received")},
    Row{.key = "CRC Received in Error",
        .quantity = quantity::crcErrors,
        .field = indexIn(channelLayout, "CRCs in error")},
};

inline constexpr std::array columns{
    ListColumn{.key = "Transport Channels", .list = channels, .rows = channelRows}};
inline constexpr RecordRows record{
    .logCode = logCode, .minimumLength = minimumLength, .layout = layout, .rows = rows, .lists = columns};

}  // namespace kelvasi::transportChannelCrc
