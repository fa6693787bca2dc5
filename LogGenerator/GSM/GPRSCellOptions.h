// SPDX-License-Identifier: Apache-2.0
// Record 0x51F6: the GPRS cell options (3GPP TS 44.060, 12.24). Two sections show the DRX timer of it.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::gprsCellOptions {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x51F6;
inline constexpr std::size_t minimumLength = 24;

inline constexpr std::array layout{
    Field{.name = "T3192", .byte = 15},
    Field{.name = "DRX timer maximum", .byte = 16},
    Field{.name = "access burst type", .byte = 17},
};
static_assert(inWireOrder(layout));

inline constexpr std::array waits{"500 ms"sv, "1000 ms"sv, "1500 ms"sv, "0 ms"sv,
                                  "80 ms"sv,  "120 ms"sv,  "160 ms"sv,  "200 ms"sv};
inline constexpr std::array burstTypes{"8-bit format"sv, "11-bit format"sv};
inline constexpr std::array rows{
    Row{.key = "T3192",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "T3192"),
        .texts = waits,
        .otherwise = "?? ms"},
    Row{.key = "Access Burst Type",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "access burst type"),
        .texts = burstTypes,
        .isFlag = true},
    Row{.key = "DRX Timer Max",
        .quantity = quantity::drxTimer,
        .field = indexIn(layout, "DRX timer maximum")},
};

inline constexpr RecordRows record{logCode, minimumLength, layout, rows};

// The timer by another name, in seconds.
inline constexpr std::array drxRows{
    Row{.key = "DRX Used",
        .quantity = quantity::drxTimer,
        .field = indexIn(layout, "DRX timer maximum"),
        .unit = " sec"},
};
inline constexpr RecordRows drxRecord{logCode, minimumLength, layout, drxRows};

}  // namespace kelvasi::gprsCellOptions
