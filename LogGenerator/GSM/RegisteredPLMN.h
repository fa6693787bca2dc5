// SPDX-License-Identifier: Apache-2.0
// Record 0x7135: the registered PLMN with its location and routing area.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::registeredPlmn {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x7135;
inline constexpr std::size_t minimumLength = 32;

// The PLMN identity is in the BCD form of 3GPP TS 24.008, 10.5.1.3.
inline constexpr std::array layout{
    Field{.name = "network operating mode", .byte = 13},
    Field{.name = "service type", .byte = 14},
    Field{.name = "MCC digit 1", .byte = 15, .bit = 0, .width = 4},
    Field{.name = "MCC digit 2", .byte = 15, .bit = 4, .width = 4},
    Field{.name = "MCC digit 3", .byte = 16, .bit = 0, .width = 4},
    Field{.name = "MNC digit 3", .byte = 16, .bit = 4, .width = 4},
    Field{.name = "MNC digit 1", .byte = 17, .bit = 0, .width = 4},
    Field{.name = "MNC digit 2", .byte = 17, .bit = 4, .width = 4},
    Field{.name = "location area code", .byte = 18, .width = 16, .isBigEndian = true},
    Field{.name = "routing area code", .byte = 20},
};
static_assert(inWireOrder(layout));

inline constexpr std::array mccDigits{indexIn(layout, "MCC digit 1"), indexIn(layout, "MCC digit 2"),
                                      indexIn(layout, "MCC digit 3")};
inline constexpr std::array mncDigits{indexIn(layout, "MNC digit 1"), indexIn(layout, "MNC digit 2"),
                                      indexIn(layout, "MNC digit 3")};

inline constexpr std::array serviceTypes{"NO_SERVICE"sv, "CS_ONLY"sv, "PS_ONLY"sv, "CS_PS_SERVICE"sv,
                                         "LIMITED_SERVICE"sv};

inline constexpr std::array rows{
    Row{.key = "Location Area Code",
        .quantity = quantity::lac,
        .field = indexIn(layout, "location area code")},
    Row{.key = "Routing Area Code", .quantity = quantity::rac, .field = indexIn(layout, "routing area code")},
    Row{.key = "Service Type",
        .quantity = quantity::serviceType,
        .field = indexIn(layout, "service type"),
        .texts = serviceTypes},
};

inline constexpr std::array operatingModes{"Class 1"sv, "Class 2"sv, "Class 3"sv};
inline constexpr std::array operatingModeRows{
    Row{.key = "Network Operating Mode",
        .quantity = quantity::operatingMode,
        .field = indexIn(layout, "network operating mode"),
        .texts = operatingModes},
};

inline constexpr RecordRows operatingMode{logCode, minimumLength, layout, operatingModeRows};

}  // namespace kelvasi::registeredPlmn
