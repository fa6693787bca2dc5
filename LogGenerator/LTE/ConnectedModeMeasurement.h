// SPDX-License-Identifier: Apache-2.0
// Record 0xB179: the intra-frequency measurement in connected mode, with its measured and detected cells.
#pragma once

#include <array>

#include "LogGenerator/LTE/MeasurementScales.h"
#include "LogGenerator/StateDecoder.h"

namespace kelvasi::lte::connectedModeMeasurement {

inline constexpr LogCode logCode = 0xB179;
inline constexpr std::size_t minimumLength = 29;

inline constexpr std::array layout{
    Field{.name = "E-ARFCN", .byte = 17, .width = 16},
    Field{.name = "serving physical cell identity", .byte = 19, .width = 16},
    Field{.name = "subframe number", .byte = 21, .width = 16},
    Field{.name = "filtered RSRP", .byte = 23, .width = 16},
    Field{.name = "filtered RSRQ", .byte = 25, .width = 16},
    Field{.name = "measured neighbours", .byte = 27},
    Field{.name = "detected cells", .byte = 28},
};
static_assert(inWireOrder(layout));

inline constexpr std::array measuredLayout{
    Field{.name = "physical cell identity", .byte = 0, .width = 16},
    Field{.name = "filtered RSRP", .byte = 2, .width = 16},
    Field{.name = "filtered RSRQ", .byte = 4, .width = 16},
};
static_assert(inWireOrder(measuredLayout));

inline constexpr std::array detectedLayout{
    Field{.name = "physical cell identity", .byte = 0, .width = 16},
};

inline constexpr CellFields serving{.family = RadioFamily::lte,
                                    .channel = fieldIn(layout, "E-ARFCN"),
                                    .code = fieldIn(layout, "serving physical cell identity")};
inline constexpr CellFields measuredCell{.family = RadioFamily::lte,
                                         .code = fieldIn(measuredLayout, "physical cell identity"),
                                         .headChannel = fieldIn(layout, "E-ARFCN")};
inline constexpr CellFields detectedCell{.family = RadioFamily::lte,
                                         .code = fieldIn(detectedLayout, "physical cell identity"),
                                         .headChannel = fieldIn(layout, "E-ARFCN")};

inline constexpr EntryList measured{
    .count = fieldIn(layout, "measured neighbours"), .start = 29, .stride = 6, .layout = measuredLayout};
inline constexpr EntryList detected{.count = fieldIn(layout, "detected cells"),
                                    .start = measured.start,
                                    .stride = 2,
                                    .layout = detectedLayout,
                                    .countBefore = measured.count,
                                    .bytesPerEntryBefore = measured.stride};

inline constexpr std::array rows{
    Row{.key = "E-ARFCN", .quantity = quantity::earfcn, .field = indexIn(layout, "E-ARFCN")},
    Row{.key = "Serving Physical Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(layout, "serving physical cell identity")},
    Row{.key = "Subframe Number",
        .quantity = quantity::frameNumber,
        .field = indexIn(layout, "subframe number")},
    Row{.key = "Serving Filtered RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(layout, "filtered RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Serving Filtered RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(layout, "filtered RSRQ"),
        .unit = " dB",
        .scale = eighthRsrq},
};
inline constexpr std::array measuredRows{
    Row{.key = "Physical Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(measuredLayout, "physical cell identity")},
    Row{.key = "Filtered RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(measuredLayout, "filtered RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Filtered RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(measuredLayout, "filtered RSRQ"),
        .unit = " dB",
        .scale = eighthRsrq},
};
inline constexpr std::array detectedRows{
    Row{.key = "Physical Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(detectedLayout, "physical cell identity")},
};

inline constexpr RecordRows record{logCode, minimumLength, layout, rows, serving};

}  // namespace kelvasi::lte::connectedModeMeasurement
