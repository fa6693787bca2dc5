// SPDX-License-Identifier: Apache-2.0
// Record 0x7131: the mobility-management state (3GPP TS 24.008, 4.1.2.1) of the circuit-switched domain.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::mmState {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x7131;
inline constexpr std::size_t minimumLength = 16;

inline constexpr std::array layout{
    Field{.name = "state", .byte = 13},
    Field{.name = "sub-state", .byte = 14},
    Field{.name = "update status", .byte = 15},
};
static_assert(inWireOrder(layout));

inline constexpr std::array states{
    "MM_NULL"sv,
    unknownText,
    unknownText,
    "MM_LOCATION_UPDATE_INITIATED"sv,
    unknownText,
    "MM_WAIT_FOR_OUTGOING_MM_CONNECTION"sv,
    "MM_CONNECTION_ACTIVE"sv,
    "MM_IMSI_DETACH_INITIATED"sv,
    "MM_PROCESS_CM_SERVICE_PROMPT"sv,
    "MM_WAIT_FOR_NETWORK_COMMAND"sv,
    "MM_LOCATION_UPDATE_REJECTED"sv,
    unknownText,
    unknownText,
    "MM_WAIT_FOR_RR_CONNECTION_LU"sv,
    "MM_WAIT_FOR_RR_CONNECTION_MM"sv,
    "MM_WAIT_FOR_RR_CONNECTION_IMSI_DETACH"sv,
    unknownText,
    "MM_REESTABLISHMENT_INITIATED"sv,
    "MM_WAIT_FOR_RR_ACTIVE"sv,
    "MM_IDLE"sv,
    "MM_WAIT_FOR_ADDITIONAL_OUTGOING_MM_ CONNECTION"sv,
    "MM_WAIT_FOR_RR_CONNECTION_ REESTABLISHMENT"sv,
    "MM_WAIT_FOR_REESTABLISH_DECISION"sv,
    "MM_LOCATION_UPDATING_PENDING"sv,
    unknownText,
    "MM_RR_CONNECTION_RELEASE_NOT_ALLOWED"sv,
};

inline constexpr std::array subStates{
    "MM_NULL_SUBSTATE"sv,        "MM_NO_IMSI"sv,
    "MM_PLMN_SEARCH"sv,          "MM_LIMITED_SERVICE"sv,
    "MM_ATTEMPTING_TO_UPDATE"sv, "MM_LOCATION_UPDATE_NEEDED"sv,
    "MM_NO_CELL_AVAILABLE"sv,    "MM_PLMN_SEARCH_NORMAL_SERVICE"sv,
    "MM_NORMAL_SERVICE"sv,
};

inline constexpr std::array updateStatuses{
    "UPDATED"sv,
    "NOT_UPDATED"sv,
    "ROAMING_NOT_ALLOWED"sv,
    "LOCATION_AREA_NOT_ALLOWED"sv,
};

inline constexpr std::array rows{
    Row{.key = "MM State", .quantity = quantity::mmState, .field = indexIn(layout, "state"), .texts = states},
    Row{.key = "MM Sub State",
        .quantity = quantity::mmSubState,
        .field = indexIn(layout, "sub-state"),
        .texts = subStates},
    Row{.key = "LU Reject Cause",
        .quantity = quantity::mmUpdateStatus,
        .field = indexIn(layout, "update status"),
        .texts = updateStatuses},
};
inline constexpr RecordRows record{logCode, minimumLength, layout, rows};
// The state alone.
inline constexpr RecordRows stateRecord{logCode, minimumLength, layout, std::span(rows).first<1>()};

}  // namespace kelvasi::mmState
