// SPDX-License-Identifier: Apache-2.0
// Texts of the values that several records show. Each ends with its value, as the texts of values past them
// do.
#pragma once

#include <array>
#include <cmath>
#include <cstdint>
#include <string_view>

#include "LogGenerator/Row.h"

namespace kelvasi {

using namespace std::string_view_literals;

inline constexpr std::string_view badValue = "[Bad Value %d]";
inline constexpr std::string_view reservedValue = "[Reserved %d]";
inline constexpr std::string_view otherIndicator = "ERI - %d";
inline constexpr std::string_view notAvailableText = "N/A";

// 3GPP2 C.S0057. The text of entry 9 lacks a blank.
inline constexpr std::array bandClasses{
    "800 MHz cellular band [0]"sv,
    "1.8 to 2.0GHz PCS band [1]"sv,
    "872 to 960MHz TACS band [2]"sv,
    "832 to 925MHz JTACS band [3]"sv,
    "1.75 to 1.87GHz Korean PCS band [4]"sv,
    "450MHz band [5]"sv,
    "2GHz band [6]"sv,
    "700MHz band [7]"sv,
    "1800 MHz band [8]"sv,
    "900 MHzband [9]"sv,
    "Secondary 800 MHz band [10]"sv,
    "400 MHz European PAMR band [11]"sv,
    "800 MHz European PAMR band [12]"sv,
};
inline constexpr std::array evdoDeviceStates{"Inactive [0]"sv, "Acquisition [1]"sv, "Sync [2]"sv,
                                             "Idle [3]"sv,     "Access [4]"sv,      "Connected [5]"sv};
inline constexpr std::array evdoSessionStates{"Closed [0]"sv, "AMP setup [1]"sv, "AT-initiated neg [2]"sv,
                                              "Initiated neg [3]"sv, "Open [4]"sv};
inline constexpr std::array deviceStates{
    "Inactive [0]"sv,
    "Deep sleep in start state [1]"sv,
    "Initial state for CDMA operation [2]"sv,
    "Acquisition [3]"sv,
    "Sync [4]"sv,
    "Slew [5]"sv,
    "Paging [6]"sv,
    "Slotted mode sleep state [7]"sv,
    "Traffic [8]"sv,
    "UnSlew [9]"sv,
    "Operation in PCG state [10]"sv,
    "Powerup state [11]"sv,
};
// 3GPP2 C.R1001.
inline constexpr std::array roamingIndicators{
    "OFF [0]"sv,
    "ON [1]"sv,
    "Flashing [2]"sv,
    "Out of Neighborhood [3]"sv,
    "Out of Building [4]"sv,
    "Preferred system [5]"sv,
    "Available system [6]"sv,
    "Alliance partner [7]"sv,
    "Premium partner [8]"sv,
    "Full service functionality [9]"sv,
    "Partial service functionality [10]"sv,
    "Banner ON [11]"sv,
    "Banner OFF [12]"sv,
};

// A strength in 1/512 units as dB; nothing to speak of at 0, which shows as minus infinity.
inline double strengthInDecibel(std::int64_t raw) {
  return 10 * std::log10(static_cast<double>(raw) / 512);
}
inline constexpr Scale strengthScale{
    .format = "%+.2f", .curve = strengthInDecibel, .formula = "10 * log10(raw / 512)"};
// A number of decibels that was calculated.
inline constexpr Scale decibelScale{.format = "%+.2f", .curve = fromRaw};
inline constexpr Scale signedWhole{.format = "%+.0f"};

}  // namespace kelvasi
