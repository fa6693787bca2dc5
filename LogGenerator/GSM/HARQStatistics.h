// SPDX-License-Identifier: Apache-2.0
// Record 0x4221: statistics of the HARQ processes of HSDPA (3GPP TS 25.321, 4.2.3).
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::harqStatistics {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x4221;
inline constexpr std::size_t minimumLength = 18;

inline constexpr std::array layout{
    Field{.name = "version", .byte = 13},
    Field{.name = "sub-frames", .byte = 14, .bit = 0, .width = 10},
    Field{.name = "carriers", .byte = 15, .bit = 2, .width = 2},
    Field{.name = "primary processes", .byte = 16},
    Field{.name = "secondary processes", .byte = 17},
};
static_assert(inWireOrder(layout));

inline constexpr std::array processLayout{
    Field{.name = "process", .byte = 0},
    Field{.name = "bits received", .byte = 1, .width = 32},
    Field{.name = "new transmissions", .byte = 5, .width = 16},
    Field{.name = "block errors", .byte = 7, .width = 16},
};
static_assert(inWireOrder(processLayout));

inline constexpr EntryList primary{
    .count = fieldIn(layout, "primary processes"), .start = 18, .stride = 9, .layout = processLayout};
// Not right behind the primary ones: each of those moves the secondary ones on by the room of 18.
inline constexpr EntryList secondary{.count = fieldIn(layout, "secondary processes"),
                                     .start = primary.start,
                                     .stride = primary.stride,
                                     .layout = processLayout,
                                     .countBefore = primary.count,
                                     .bytesPerEntryBefore = 162};

inline constexpr std::array carriers{"Single Carrier"sv, "MIMO"sv, "Dual Carrier"sv, "Reserved"sv};
inline constexpr std::array rows{
    Row{.key = "Version", .quantity = quantity::version, .field = indexIn(layout, "version")},
    Row{.key = "Sub Frames", .quantity = quantity::subFrames, .field = indexIn(layout, "sub-frames")},
    Row{.key = "Carrier Info",
        .quantity = quantity::carriers,
        .field = indexIn(layout, "carriers"),
        .texts = carriers},
};
inline constexpr std::array processRows{
    Row{.key = "Process ID", .quantity = quantity::processId, .field = indexIn(processLayout, "process")},
    Row{.key = "No Rx Bits",
        .quantity = quantity::receivedBits,
        .field = indexIn(processLayout, "bits received"),
        .isUnsigned = true},
    Row{.key = "New Tx",
        .quantity = quantity::newTransmissions,
        .field = indexIn(processLayout, "new transmissions")},
    Row{.key = "Block Errors",
        .quantity = quantity::blockErrors,
        .field = indexIn(processLayout, "block errors")},
};

// A count of 0 leaves the list of before.
inline constexpr std::array columns{
    ListColumn{
        .key = "Primary HARQ Process", .list = primary, .rows = processRows, .staysWithoutEntries = true},
    ListColumn{.key = "Secondary HARQ Process",
               .list = secondary,
               .rows = processRows,
               .staysWithoutEntries = true}};
inline constexpr RecordRows record{
    .logCode = logCode, .minimumLength = minimumLength, .layout = layout, .rows = rows, .lists = columns};

}  // namespace kelvasi::harqStatistics
