// SPDX-License-Identifier: Apache-2.0
// Record 0x7132: registration state and PLMN selection mode. The three Process decoders show the same row of
// it, each in its own section.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::registrationState {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x7132;
inline constexpr std::size_t minimumLength = 16;

inline constexpr std::array layout{
    Field{.name = "registration state", .byte = 13},
    Field{.name = "PLMN selection mode", .byte = 14},
};
static_assert(inWireOrder(layout));

inline constexpr std::array states{
    "REG_STATE_INACTIVE"sv,      "REG_STATE_IDLE"sv,          "REG_STATE_REGISTERING"sv,
    "REG_STATE_DEREGISTERING"sv, "REG_STATE_MANUAL_SEARCH"sv, "REG_STATE_AUTOMATIC_SEARCH"sv,
    "REG_STATE_OFFLINE"sv,
};

inline constexpr std::array serviceStateRows{
    Row{.key = "MM Service State",
        .quantity = quantity::registrationState,
        .field = indexIn(layout, "registration state"),
        .texts = states},
};
inline constexpr RecordRows serviceState{logCode, minimumLength, layout, serviceStateRows};

}  // namespace kelvasi::registrationState
