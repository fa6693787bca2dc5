// SPDX-License-Identifier: Apache-2.0
// Record 0xD0E0: the state of the radio resource control (3GPP TS 25.331, 7.1).
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::utran::rrcState {

inline constexpr LogCode logCode = 0xD0E0;
inline constexpr std::size_t expectedLength = 15;

inline constexpr std::array layout{
    Field{.name = "layout version", .byte = 13},
    Field{.name = "mode", .byte = 14},
};
static_assert(inWireOrder(layout));

inline constexpr std::int64_t knownVersion = 1;

inline constexpr std::array<std::string_view, 6> modes{"Disconnected", "Connecting", "Cell Fach",
                                                       "Cell DCH",     "Cell PCH",   "Cell URA PCH"};
inline constexpr std::string_view unknownMode = "Unknown RRC Mode";

}  // namespace kelvasi::utran::rrcState
