// SPDX-License-Identifier: Apache-2.0
// The records of UMTS radio resource control: RRC state, transmit power, serving cell and ciphering.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/EntryList.h"
#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

namespace rrcState {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x4125;
inline constexpr std::array layout{Field{.name = "RRC state", .byte = 13}};

inline constexpr std::array states{"Disconnected"sv, "Connecting"sv, "CELL_FACH"sv,
                                   "CELL_DCH"sv,     "CELL_PCH"sv,   "URA_PCH"sv};
inline constexpr std::array rows{
    Row{.key = "RRC State",
        .quantity = quantity::rrcState,
        .field = indexIn(layout, "RRC state"),
        .texts = states},
};
inline constexpr RecordRows record{logCode, 14, layout, rows};

}  // namespace rrcState

namespace transmitPower {

inline constexpr LogCode logCode = 0x4031;
inline constexpr std::size_t minimumLength = 16;
inline constexpr std::array layout{Field{.name = "samples", .byte = 14}};

// An AGC value of 0 stands for none.
inline constexpr std::array sampleLayout{
    Field{.name = "transmit AGC", .byte = 4, .width = 16, .isSigned = true},
};
inline constexpr EntryList samples{
    .count = fieldIn(layout, "samples"), .start = 16, .stride = 14, .layout = sampleLayout};

}  // namespace transmitPower

namespace umtsServingCell {

inline constexpr LogCode logCode = 0x4127;
inline constexpr std::size_t minimumLength = 29;
inline constexpr std::array layout{
    Field{.name = "uplink UARFCN", .byte = 13, .width = 32},
    Field{.name = "downlink UARFCN", .byte = 17, .width = 32},
    Field{.name = "cell identity", .byte = 21, .width = 32},
    Field{.name = "URA identity", .byte = 25, .width = 16},
};
static_assert(inWireOrder(layout));

inline constexpr std::array cellRows{
    Row{.key = "Cell ID", .quantity = quantity::cellId, .field = indexIn(layout, "cell identity")},
    Row{.key = "Downlink Frequency",
        .quantity = quantity::uarfcn,
        .field = indexIn(layout, "downlink UARFCN")},
    Row{.key = "Uplink Frequency", .quantity = quantity::uarfcn, .field = indexIn(layout, "uplink UARFCN")},
};
inline constexpr CellFields cell{.family = RadioFamily::umts,
                                 .channel = fieldIn(layout, "downlink UARFCN"),
                                 .cellId = fieldIn(layout, "cell identity"),
                                 .isServing = true};
inline constexpr std::array areaRows{
    Row{.key = "URA ID", .quantity = quantity::uraId, .field = indexIn(layout, "URA identity")},
};

}  // namespace umtsServingCell

namespace ciphering {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x4157;
inline constexpr std::array layout{Field{.name = "ciphering", .byte = 13}};

inline constexpr std::array states{"Disabled"sv, "Enabled"sv};
inline constexpr std::array rows{
    Row{.key = "Ciphering",
        .quantity = quantity::ciphering,
        .field = indexIn(layout, "ciphering"),
        .texts = states,
        .isFlag = true},
};
inline constexpr RecordRows record{logCode, 19, layout, rows};

}  // namespace ciphering

}  // namespace kelvasi
