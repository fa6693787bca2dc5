// SPDX-License-Identifier: Apache-2.0
// The records of GSM radio resource management (3GPP TS 44.018): its state, and discontinuous transmission.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

namespace rrState {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x512C;
inline constexpr std::array layout{
    Field{.name = "state", .byte = 13},
    Field{.name = "sub-state", .byte = 14},
    Field{.name = "status", .byte = 15},
    Field{.name = "mode", .byte = 16},
};
static_assert(inWireOrder(layout));

// The blanks before PROGRESS belong to the texts.
inline constexpr std::array states{
    "RR_INACTIVE"sv,
    "RR_GOING_ACTIVE"sv,
    "RR_GOING_INACTIVE"sv,
    "RR_CELL_SELECTION"sv,
    "RR_PLMN_LIST_CONSTRUCTION"sv,
    "RR_IDLE"sv,
    "RR_CELL_RESELECTION"sv,
    "RR_CONNECTION_PENDING"sv,
    "RR_CHOOSE_CELL"sv,
    "RR_DATA_TRANSFER"sv,
    "RR_NO_CHANNELS"sv,
    "RR_CONNECTION_RELEASE"sv,
    "RR_EARLY_CAMPED_WAIT_FOR_SI"sv,
    "RR_W2G_INTERRAT_HANDOVER_ PROGRESS"sv,
    "RR_W2G_INTERRAT_RESELECTION_PROGRESS"sv,
    "RR_WAIT_FOR_EARLY_PSCAN"sv,
    "GRR51"sv,
    "GRR52"sv,
    "RR_G2W_INTERRAT_RESELECTION_PROGRESS"sv,
    "RR_G2W_INTERRAT_HANDOVER_ PROGRESS"sv,
    "RR_CELL_REEST"sv,
    "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS"sv,
};
inline constexpr std::array modes{"Voice"sv, "Data"sv};
inline constexpr std::array rows{
    Row{.key = "RR State", .quantity = quantity::rrState, .field = indexIn(layout, "state"), .texts = states},
    Row{.key = "RR Sub State", .quantity = quantity::rrSubState, .field = indexIn(layout, "sub-state")},
    Row{.key = "RR Status", .quantity = quantity::rrStatus, .field = indexIn(layout, "status")},
    Row{.key = "RR Mode",
        .quantity = quantity::rrMode,
        .field = indexIn(layout, "mode"),
        .texts = modes,
        .isFlag = true},
};
inline constexpr RecordRows record{logCode, 17, layout, rows};

}  // namespace rrState

namespace dtx {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x5072;
inline constexpr std::array layout{Field{.name = "DTX in use", .byte = 19}};

inline constexpr std::array states{"OFF"sv, "ON"sv};
inline constexpr std::array rows{
    Row{.key = "DTX Used",
        .quantity = quantity::dtx,
        .field = indexIn(layout, "DTX in use"),
        .texts = states,
        .isFlag = true},
};
inline constexpr RecordRows record{logCode, 20, layout, rows};

}  // namespace dtx

}  // namespace kelvasi
