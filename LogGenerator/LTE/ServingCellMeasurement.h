// SPDX-License-Identifier: Apache-2.0
// Record 0xB17F: the measurement of the serving cell in idle mode, with what cell selection makes of it.
#pragma once

#include <array>

#include "LogGenerator/LTE/MeasurementScales.h"
#include "LogGenerator/StateDecoder.h"

namespace kelvasi::lte::servingCellMeasurement {

inline constexpr LogCode logCode = 0xB17F;
inline constexpr std::size_t minimumLength = 33;

inline constexpr std::array layout{
    Field{.name = "version", .byte = 13},
    Field{.name = "E-ARFCN", .byte = 17, .bit = 0, .width = 16},
    Field{.name = "physical cell identity", .byte = 19, .bit = 0, .width = 9},
    Field{.name = "serving layer priority", .byte = 20, .bit = 1, .width = 4},
    Field{.name = "measured RSRP", .byte = 21, .bit = 0, .width = 9},
    Field{.name = "average RSRP", .byte = 22, .bit = 1, .width = 9},
    Field{.name = "measured RSRQ", .byte = 23, .bit = 2, .width = 7},
    Field{.name = "average RSRQ", .byte = 24, .bit = 1, .width = 7},
    Field{.name = "measured RSSI", .byte = 25, .bit = 0, .width = 9},
    Field{.name = "Qrxlevmin", .byte = 26, .bit = 1, .width = 6},
    Field{.name = "P-Max", .byte = 26, .bit = 7, .width = 7},
    Field{.name = "maximum UE transmit power", .byte = 27, .bit = 6, .width = 6},
    Field{.name = "Srxlev", .byte = 29, .bit = 0, .width = 7},
    Field{.name = "DRX cycles with S below 0", .byte = 29, .bit = 7, .width = 6},
    Field{.name = "S-IntraSearch", .byte = 30, .bit = 5, .width = 6},
    Field{.name = "S-NonIntraSearch", .byte = 31, .bit = 3, .width = 6},
    Field{.name = "measurement rules updated", .byte = 32, .bit = 1, .width = 1},
    Field{.name = "measurement rules", .byte = 32, .bit = 2, .width = 4},
};
static_assert(inWireOrder(layout));

inline constexpr CellFields cell{.family = RadioFamily::lte,
                                 .channel = fieldIn(layout, "E-ARFCN"),
                                 .code = fieldIn(layout, "physical cell identity"),
                                 .isServing = true};

inline constexpr ValueText noPower{64, "Not Present"};
inline constexpr ValueText noSearch{32, "Not Present"};
inline constexpr std::array<std::string_view, 2> truth{"False", "True"};

inline constexpr std::array rows{
    Row{.key = "Version", .quantity = quantity::version, .field = indexIn(layout, "version")},
    Row{.key = "E-ARFCN", .quantity = quantity::earfcn, .field = indexIn(layout, "E-ARFCN")},
    Row{.key = "Physical Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(layout, "physical cell identity")},
    Row{.key = "Serving Layer Priority",
        .quantity = quantity::priority,
        .field = indexIn(layout, "serving layer priority")},
    Row{.key = "Measured RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(layout, "measured RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Average RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(layout, "average RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Measured RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(layout, "measured RSRQ"),
        .unit = " dB",
        .scale = quarterRsrq},
    Row{.key = "Average RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(layout, "average RSRQ"),
        .unit = " dB",
        .scale = quarterRsrq},
    Row{.key = "Measured RSSI",
        .quantity = quantity::rssi,
        .field = indexIn(layout, "measured RSSI"),
        .unit = " dBm",
        .scale = halfRssi},
    Row{.key = "Qrxlevmin",
        .quantity = quantity::qrxlevmin,
        .field = indexIn(layout, "Qrxlevmin"),
        .unit = " dBm",
        .factor = 2,
        .offset = -140},
    Row{.key = "P_Max",
        .quantity = quantity::pMax,
        .field = indexIn(layout, "P-Max"),
        .unit = " dBm",
        .special = noPower,
        .offset = -30},
    // Six bits never reach the value that stands for an absent power.
    Row{.key = "Max UE Tx Power",
        .quantity = quantity::ueTxPower,
        .field = indexIn(layout, "maximum UE transmit power"),
        .unit = " dBm",
        .special = noPower,
        .offset = -30},
    Row{.key = "Srxlev",
        .quantity = quantity::srxlev,
        .field = indexIn(layout, "Srxlev"),
        .unit = " dBm",
        .offset = -30},
    Row{.key = "Num of Consecutive DRX Cycles of S < 0",
        .quantity = quantity::drxCycles,
        .field = indexIn(layout, "DRX cycles with S below 0")},
    Row{.key = "S Intra Search",
        .quantity = quantity::searchThreshold,
        .field = indexIn(layout, "S-IntraSearch"),
        .unit = " dB",
        .special = noSearch,
        .factor = 2},
    // Shown in dBm although it is a difference like the row before it.
    Row{.key = "S Non Intra Search",
        .quantity = quantity::searchThreshold,
        .field = indexIn(layout, "S-NonIntraSearch"),
        .unit = " dBm",
        .special = noSearch,
        .factor = 2},
    Row{.key = "Measurement Rules Updated",
        .quantity = quantity::flag,
        .field = indexIn(layout, "measurement rules updated"),
        .texts = truth},
    Row{.key = "Measurement Rules",
        .quantity = quantity::measurementRules,
        .field = indexIn(layout, "measurement rules")},
};
inline constexpr RecordRows record{logCode, minimumLength, layout, rows, cell};

}  // namespace kelvasi::lte::servingCellMeasurement
