// SPDX-License-Identifier: Apache-2.0
// The records of GPRS in the serving cell: where SI13 is, access, the packet broadcast channel and its
// status.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

inline constexpr ValueText notAvailable{255, "Not Available"};

namespace si13 {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x51F4;
inline constexpr std::array layout{Field{.name = "position", .byte = 14}};

inline constexpr std::array positions{"Located on BCCH"sv, "Located on Extended BCCH"sv};
inline constexpr std::array rows{
    Row{.key = "SI13 Position",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "position"),
        .special = notAvailable,
        .texts = positions},
};
inline constexpr RecordRows record{logCode, 15, layout, rows};

}  // namespace si13

namespace packetAccess {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x51F5;
inline constexpr std::array layout{
    Field{.name = "PFC support", .byte = 13},
    Field{.name = "priority access threshold", .byte = 14},
    Field{.name = "network control order", .byte = 15},
};
static_assert(inWireOrder(layout));

inline constexpr std::array controlOrders{"NC0"sv, "NC1"sv, "NC2"sv};
inline constexpr std::array pfcSupports{"Not Supported"sv, "Supported"sv};
inline constexpr std::array thresholds{
    "Barred (PKT access not allowed in the Cell)"sv,
    "Barred"sv,
    "Barred"sv,
    "1 Only"sv,
    "1 to 2"sv,
    "1 to 3"sv,
    "1 to 4"sv,
    "Allowed"sv,
};
// For the packet flow context, other than in its neighbours, 255 stands for "Available".
inline constexpr std::array rows{
    Row{.key = "Network Control Order",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "network control order"),
        .special = notAvailable,
        .texts = controlOrders},
    Row{.key = "PFC Supported",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "PFC support"),
        .special = ValueText{255, "Available"},
        .texts = pfcSupports},
    Row{.key = "Priority Access Threshold",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "priority access threshold"),
        .special = notAvailable,
        .texts = thresholds},
};
inline constexpr RecordRows record{logCode, 18, layout, rows};

}  // namespace packetAccess

namespace pbcch {

inline constexpr LogCode logCode = 0x51FB;
inline constexpr std::array layout{Field{.name = "PBCCH present", .byte = 13}};

inline constexpr std::array rows{
    Row{.key = "PBCCH Present", .quantity = quantity::cellOption, .field = indexIn(layout, "PBCCH present")},
};
inline constexpr RecordRows record{logCode, 34, layout, rows};

}  // namespace pbcch

namespace packetStatus {

using namespace std::string_view_literals;

inline constexpr LogCode logCode = 0x51FD;
inline constexpr std::array layout{
    Field{.name = "packet PSI status", .byte = 13}, Field{.name = "count LR", .byte = 14},
    Field{.name = "count HR", .byte = 15},          Field{.name = "extended measurement order", .byte = 16},
    Field{.name = "packet SI status", .byte = 33},
};
static_assert(inWireOrder(layout));

inline constexpr std::array supports{"Not Supported"sv, "Supported"sv};
inline constexpr std::array rows{
    Row{.key = "Ext Measurement Order",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "extended measurement order")},
    Row{.key = "Packet PSI Status",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "packet PSI status")},
    Row{.key = "Packet SI Status",
        .quantity = quantity::cellOption,
        .field = indexIn(layout, "packet SI status"),
        .texts = supports,
        .isFlag = true},
    Row{.key = "Count LR", .quantity = quantity::count, .field = indexIn(layout, "count LR")},
    Row{.key = "Count HR", .quantity = quantity::count, .field = indexIn(layout, "count HR")},
};
inline constexpr RecordRows record{logCode, 35, layout, rows};

}  // namespace packetStatus

}  // namespace kelvasi
