// SPDX-License-Identifier: Apache-2.0
// Record 0x5137: measurements of the GSM serving cell and its neighbours. Four sections read it, two of them
// the same two words as different things.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::gsmMeasurements {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x5137;
inline constexpr std::size_t minimumLength = 29;

inline constexpr std::array layout{
    Field{.name = "receive level", .byte = 15},
    Field{.name = "C1 or full receive quality", .byte = 16, .width = 32},
    Field{.name = "C2 or sub receive quality", .byte = 20, .width = 32},
    Field{.name = "reselect hysteresis", .byte = 26},
    Field{.name = "neighbours", .byte = 28},
};
static_assert(inWireOrder(layout));

inline constexpr std::array neighbourLayout{
    Field{.name = "ARFCN", .byte = 0, .width = 16},
    Field{.name = "RSSI", .byte = 2},
    Field{.name = "C1", .byte = 3, .width = 32},
};
static_assert(inWireOrder(neighbourLayout));

inline constexpr EntryList neighbours{
    .count = fieldIn(layout, "neighbours"), .start = 29, .stride = 14, .layout = neighbourLayout};

// The record says nothing of the serving cell but what it is not.
inline constexpr CellFields servingCell{.family = RadioFamily::gsm,
                                        .isServing = true,
                                        .others = neighbours,
                                        .otherChannel = fieldIn(neighbourLayout, "ARFCN")};

inline constexpr std::array hysteresisTexts{"Not Applied"sv, "Applied"sv};
inline constexpr std::array hysteresisRows{
    Row{.key = "Cell Reselect Hysteresis",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "reselect hysteresis"),
        .texts = hysteresisTexts,
        .isFlag = true},
};
inline constexpr RecordRows hysteresis{logCode, minimumLength, layout, hysteresisRows};

// Whole words, of which the serving cell's section shows the low halves as C1 and C2.
inline constexpr std::array receptionRows{
    Row{.key = "Serving Rx Level", .quantity = quantity::rxlev, .field = indexIn(layout, "receive level")},
    Row{.key = "Rx Quality Full",
        .quantity = quantity::rxqual,
        .field = indexIn(layout, "C1 or full receive quality")},
    Row{.key = "Rx Quality Sub",
        .quantity = quantity::rxqual,
        .field = indexIn(layout, "C2 or sub receive quality")},
};
inline constexpr RecordRows reception{logCode, minimumLength, layout, receptionRows, servingCell};

// C1 and C2 (3GPP TS 45.008, 6.4) are the low halves of their words.
inline constexpr std::array levelRows{
    Row{.key = "RSSI",
        .quantity = quantity::rxlev,
        .field = indexIn(layout, "receive level"),
        .unit = " dBm"},
    Row{.key = "C1 Value",
        .quantity = quantity::c1,
        .field = indexIn(layout, "C1 or full receive quality"),
        .lowBits = 16,
        .isSignedNumber = true},
    Row{.key = "C2 Value",
        .quantity = quantity::c2,
        .field = indexIn(layout, "C2 or sub receive quality"),
        .lowBits = 16,
        .isSignedNumber = true},
};
inline constexpr RecordRows levels{logCode, minimumLength, layout, levelRows, servingCell};

}  // namespace kelvasi::gsmMeasurements
