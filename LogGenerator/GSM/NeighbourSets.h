// SPDX-License-Identifier: Apache-2.0
// Record 0x4005: the UMTS and GSM cells ranked for reselection (3GPP TS 25.304, 5.2.6).
#pragma once

#include <array>

#include "LogGenerator/CellFields.h"
#include "LogGenerator/EntryList.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/Row.h"

namespace kelvasi::neighbourSets {

inline constexpr LogCode logCode = 0x4005;
inline constexpr std::size_t minimumLength = 15;

inline constexpr std::array layout{
    Field{.name = "UMTS cells", .byte = 13},
    Field{.name = "GSM cells", .byte = 14},
};
static_assert(inWireOrder(layout));

inline constexpr std::array umtsLayout{
    Field{.name = "downlink UARFCN", .byte = 0, .width = 16, .isSigned = true},
    Field{.name = "scrambling code", .byte = 2, .width = 16},
    Field{.name = "RSCP", .byte = 4, .isSigned = true},
    Field{.name = "rank-cell RSCP", .byte = 5, .width = 16, .isSigned = true},
    Field{.name = "Ec/No in half dB", .byte = 7, .isSigned = true},
    Field{.name = "ranking value", .byte = 8, .width = 16, .isSigned = true},
};
static_assert(inWireOrder(umtsLayout));

inline constexpr std::array gsmLayout{
    Field{.name = "ARFCN", .byte = 0, .width = 16},
    Field{.name = "BSIC", .byte = 2, .width = 16},
    Field{.name = "RSSI", .byte = 4, .isSigned = true},
    Field{.name = "ranking value", .byte = 5, .width = 16, .isSigned = true},
};
static_assert(inWireOrder(gsmLayout));

inline constexpr CellFields umtsCell{.family = RadioFamily::umts,
                                     .channel = fieldIn(umtsLayout, "downlink UARFCN"),
                                     .code = fieldIn(umtsLayout, "scrambling code")};
inline constexpr CellFields gsmCell{
    .family = RadioFamily::gsm, .channel = fieldIn(gsmLayout, "ARFCN"), .code = fieldIn(gsmLayout, "BSIC")};

// Both lists begin at the same byte, whatever the other one counts.
inline constexpr std::size_t firstEntry = 15;
inline constexpr EntryList umtsCells{
    .count = fieldIn(layout, "UMTS cells"), .start = firstEntry, .stride = 10, .layout = umtsLayout};
inline constexpr EntryList gsmCells{
    .count = fieldIn(layout, "GSM cells"), .start = firstEntry, .stride = 7, .layout = gsmLayout};

inline constexpr std::array umtsRows{
    Row{.key = "Scrambling Code",
        .quantity = quantity::scramblingCode,
        .field = indexIn(umtsLayout, "scrambling code")},
    Row{.key = "RSCP",
        .quantity = quantity::rscp,
        .field = indexIn(umtsLayout, "RSCP"),
        .unit = " dB",
        .offset = -21},
    Row{.key = "Energy Per Chip",
        .quantity = quantity::ecno,
        .field = indexIn(umtsLayout, "Ec/No in half dB"),
        .unit = " dB",
        .scale = Scale{.factor = 0.5, .format = "%f"}},
    Row{.key = "Downlink Frequency",
        .quantity = quantity::uarfcn,
        .field = indexIn(umtsLayout, "downlink UARFCN")},
    Row{.key = "Ranking Value", .quantity = quantity::ranking, .field = indexIn(umtsLayout, "ranking value")},
    Row{.key = "Rank Cell RSCP",
        .quantity = quantity::rscp,
        .field = indexIn(umtsLayout, "rank-cell RSCP"),
        .unit = " dB"},
};
inline constexpr std::array gsmRows{
    Row{.key = "ARFCN", .quantity = quantity::arfcn, .field = indexIn(gsmLayout, "ARFCN")},
    Row{.key = "BSIC", .quantity = quantity::bsic, .field = indexIn(gsmLayout, "BSIC")},
    Row{.key = "RSSI", .quantity = quantity::rssi, .field = indexIn(gsmLayout, "RSSI"), .unit = " dBm"},
    Row{.key = "Ranking Value", .quantity = quantity::ranking, .field = indexIn(gsmLayout, "ranking value")},
};

}  // namespace kelvasi::neighbourSets
