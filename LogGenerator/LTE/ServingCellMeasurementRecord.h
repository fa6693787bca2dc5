// SPDX-License-Identifier: Apache-2.0
// Record 0xB17F: the measurement of the serving cell in idle mode, with what cell selection makes of it.
#pragma once

#include <array>

#include "LogGenerator/CellFields.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

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

}  // namespace kelvasi::lte::servingCellMeasurement
