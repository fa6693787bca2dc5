// SPDX-License-Identifier: Apache-2.0
// Record 0x1183: state and RF of the EV-DO air interface (3GPP2 C.S0024).
#pragma once

#include <array>

#include "LogGenerator/C2K/C2KRecord.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::evdoStatus {

inline constexpr LogCode logCode = 0x1183;
inline constexpr std::size_t length = 50;

inline constexpr std::array layout{
    Field{.name = "channel", .byte = 13, .bit = 0, .width = 11},
    Field{.name = "band class", .byte = 14, .bit = 3, .width = 5},
    Field{.name = "Rx AGC 0", .byte = 15, .isSigned = true},
    Field{.name = "Rx AGC 1", .byte = 16, .isSigned = true},
    Field{.name = "Tx AGC", .byte = 17, .isSigned = true},
    Field{.name = "serving PN offset", .byte = 18, .width = 16},
    Field{.name = "device state", .byte = 36},
    Field{.name = "session state", .byte = 37},
    Field{.name = "UATI24", .byte = 38, .width = 24},
    Field{.name = "color code", .byte = 41},
};
static_assert(inWireOrder(layout));

inline constexpr std::int64_t accessState = 4;  // below it, the second receiver and the transmitter are off

Outcome parse(const C2KUpdate& update);
std::span<const RecordPart> parts();
inline constexpr C2KRecord record{logCode, length, parse, parts};

}  // namespace kelvasi::evdoStatus
