// SPDX-License-Identifier: Apache-2.0
// Record 0xB0C2: the identity, frequencies and bandwidths of the serving cell.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/CellFields.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/Row.h"

namespace kelvasi::lte::servingCell {

inline constexpr LogCode logCode = 0xB0C2;
inline constexpr std::size_t minimumLength = 38;

inline constexpr std::array layout{
    Field{.name = "physical cell identity", .byte = 14, .width = 16},
    Field{.name = "downlink E-ARFCN", .byte = 16, .width = 16},
    Field{.name = "uplink E-ARFCN", .byte = 18, .width = 16},
    Field{.name = "downlink bandwidth", .byte = 20},
    Field{.name = "uplink bandwidth", .byte = 21},
    Field{.name = "cell identity", .byte = 22, .width = 32},
    Field{.name = "tracking area code", .byte = 26, .width = 16},
    Field{.name = "frequency band indicator", .byte = 28, .width = 32},
};
static_assert(inWireOrder(layout));

inline constexpr CellFields cell{.family = RadioFamily::lte,
                                 .channel = fieldIn(layout, "downlink E-ARFCN"),
                                 .code = fieldIn(layout, "physical cell identity"),
                                 .cellId = fieldIn(layout, "cell identity"),
                                 .isServing = true};

// By the number of resource blocks (3GPP TS 36.101, table 5.6-1).
inline constexpr auto bandwidths = [] {
  std::array<std::string_view, 101> texts;
  texts.fill(unknownText);
  texts[6] = "1.4 MHz";
  texts[15] = "3 MHz";
  texts[25] = "5 MHz";
  texts[50] = "10 MHz";
  texts[75] = "15 MHz";
  texts[100] = "20 MHz";
  return texts;
}();

}  // namespace kelvasi::lte::servingCell
