// SPDX-License-Identifier: Apache-2.0
// Record 0x119C: state, RF and active set of the 1x air interface (3GPP2 C.S0005), in four sub-packets.
#pragma once

#include <array>

#include "LogGenerator/C2K/C2KRecord.h"
#include "LogGenerator/C2K/SubPackets.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::deviceStatus {

inline constexpr LogCode logCode = 0x119C;
inline constexpr std::int64_t trafficState = 8;

inline constexpr std::int64_t stateId = 1;
inline constexpr std::array stateLayout{Field{.name = "state", .byte = 4}};

inline constexpr std::int64_t radioId = 2;
inline constexpr std::array radioLayout{
    Field{.name = "Rx 0 band class", .byte = 4},
    Field{.name = "Rx 1 band class", .byte = 5},
    Field{.name = "Rx 0 channel", .byte = 6, .width = 16},
    Field{.name = "Rx 1 channel", .byte = 8, .width = 16},
    Field{.name = "Rx 0 AGC", .byte = 10, .isSigned = true},
    Field{.name = "Rx 1 AGC", .byte = 11, .isSigned = true},
    Field{.name = "Tx AGC", .byte = 12, .width = 16, .isSigned = true},
};
static_assert(inWireOrder(radioLayout));

inline constexpr std::int64_t activeSetId = 3;
inline constexpr std::array activeSetLayout{
    Field{.name = "window", .byte = 4, .width = 16},
    Field{.name = "gain", .byte = 6},
    Field{.name = "energy exponent", .byte = 7},
    Field{.name = "count", .byte = 8},
    Field{.name = "fingers", .byte = 9},
    Field{.name = "reference PN offset", .byte = 10, .width = 16},
};
static_assert(inWireOrder(activeSetLayout));

// Pilot records start at the sub-packet's own start; how far apart they are depends on the number of fingers.
inline constexpr std::array pilotLayout{Field{.name = "PN offset", .byte = 12, .width = 16}};
constexpr std::size_t pilotStride(std::int64_t fingers) {
  return (static_cast<std::size_t>(fingers) * 6 + 15) / 4 * 4;
}
constexpr std::size_t pilotEnergyAt(std::int64_t fingers) {
  return static_cast<std::size_t>(fingers) * 4 + 24;
}

inline constexpr std::int64_t fingersId = 4;  // has to be there, though nothing of it is shown

Outcome parse(const C2KUpdate& update);
std::span<const RecordPart> parts();
inline constexpr C2KRecord record{logCode, subPackets::minimumLength, parse, parts};

}  // namespace kelvasi::deviceStatus
