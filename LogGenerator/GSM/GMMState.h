// SPDX-License-Identifier: Apache-2.0
// Record 0x7130: the GPRS mobility-management state (3GPP TS 24.008, 4.1.3.1) of the packet-switched domain.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::gmmState {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x7130;
inline constexpr std::size_t minimumLength = 16;

inline constexpr std::array layout{
    Field{.name = "state", .byte = 13},
    Field{.name = "sub-state", .byte = 14},
    Field{.name = "update status", .byte = 15},
};
static_assert(inWireOrder(layout));

inline constexpr std::array states{
    "GMM_NULL"sv,
    "GMM_DEREGISTERED"sv,
    "GMM_REGISTERED_INITIATED"sv,
    "GMM_REGISTERED"sv,
    "GMM_DEREGISTERED_INITIATED"sv,
    "GMM_ROUTING_AREA_UPDATE_INITIATED"sv,
    "GMM_SERVICE_REQUEST_INITIATED"sv,
};

// The text of value 9 lacks a T; that of value 3 has it.
inline constexpr std::array subStates{
    "GMM_NORMAL_SERVICE"sv,
    "GMM_LIMITED_SERVICE"sv,
    "GMM_ATTACH_NEEDED"sv,
    "GMM_ATTEMPTING_TO_ATTACH"sv,
    "GMM_NO_IMSI"sv,
    "GMM_NO_CELL_AVAILABLE"sv,
    "GMM_PLMN_SEARCH"sv,
    "GMM_SUSPENDED"sv,
    "GMM_UPDATE_NEEDED"sv,
    "GMM_ATTEMPING_TO_UPDATE"sv,
    "GMM_ATTEMPTING_TO_UPDATE_MM"sv,
    "GMM_IMSI_DETACH_INITIATED"sv,
    "GMM_NULL_SUBSTATE"sv,
};

inline constexpr std::array updateStatuses{
    "GMM_GU1_UPDATED"sv,
    "GMM_GU2_NOT_UPDATED"sv,
    "GMM_GU3_PLMN_NOT_ALLOWED"sv,
    "GMM_GU3_ROUTING_AREA_NOT_ALLOWED"sv,
};

// The rows carry the names of their circuit-switched counterparts.
inline constexpr std::array rows{
    Row{.key = "MM State",
        .quantity = quantity::gmmState,
        .field = indexIn(layout, "state"),
        .texts = states},
    Row{.key = "MM Sub State",
        .quantity = quantity::gmmSubState,
        .field = indexIn(layout, "sub-state"),
        .texts = subStates},
    Row{.key = "Attach Reject Cause",
        .quantity = quantity::gmmUpdateStatus,
        .field = indexIn(layout, "update status"),
        .texts = updateStatuses},
};

inline constexpr RecordRows record{logCode, minimumLength, layout, rows};

}  // namespace kelvasi::gmmState
