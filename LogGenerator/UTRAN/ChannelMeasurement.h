// SPDX-License-Identifier: Apache-2.0
// Record 0xD00C: the transport channels with their block error rates, and behind them the coded composite
// transport channels with their signal-to-interference ratios.
#pragma once

#include <array>

#include "LogGenerator/ListDecoder.h"

namespace kelvasi::utran::channelMeasurement {

inline constexpr LogCode logCode = 0xD00C;
inline constexpr std::size_t minimumLength = 17;

inline constexpr std::array layout{
    Field{.name = "transport channels", .byte = 14, .bit = 6, .width = 6},
    Field{.name = "coded composite channels", .byte = 15, .bit = 4, .width = 4},
};
static_assert(inWireOrder(layout));

inline constexpr std::array transportLayout{
    Field{.name = "TRCH identity", .byte = 0},
    Field{.name = "BLER measurement", .byte = 1},
};
static_assert(inWireOrder(transportLayout));

inline constexpr std::array compositeLayout{
    Field{.name = "CCTRCH identity", .byte = 0}, Field{.name = "timeslot number", .byte = 1},
    Field{.name = "SIR 0", .byte = 2},           Field{.name = "SIR 1", .byte = 3},
    Field{.name = "SIR 2", .byte = 4},           Field{.name = "SIR 3", .byte = 5},
    Field{.name = "SIR 4", .byte = 6},           Field{.name = "SIR 5", .byte = 7},
};
static_assert(inWireOrder(compositeLayout));

inline constexpr EntryList transportChannels{
    .count = fieldIn(layout, "transport channels"), .start = 17, .stride = 2, .layout = transportLayout};
inline constexpr EntryList compositeChannels{.count = fieldIn(layout, "coded composite channels"),
                                             .start = 289,
                                             .stride = 8,
                                             .layout = compositeLayout,
                                             .countBefore = transportChannels.count,
                                             .bytesPerEntryBefore = 34};

// A coded composite channel has one ratio for each of these timeslots.
inline constexpr std::size_t timeslots = 6;
inline constexpr std::span ratioLayout =
    std::span(compositeLayout).subspan<indexIn(compositeLayout, "SIR 0")>();
static_assert(ratioLayout.size() == timeslots);

// Throws ArrayOutOfBoundsException for a timeslot that there is not.
std::int64_t ratioOf(RecordView compositeChannel, std::size_t timeslot);

inline constexpr std::array transportRows{
    Row{.key = "TRCH ID",
        .quantity = quantity::channelId,
        .field = indexIn(transportLayout, "TRCH identity")},
    Row{.key = "TRCH BLER Measurement",
        .quantity = quantity::bler,
        .field = indexIn(transportLayout, "BLER measurement")},
};

}  // namespace kelvasi::utran::channelMeasurement
