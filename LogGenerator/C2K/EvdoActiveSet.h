// SPDX-License-Identifier: Apache-2.0
// Record 0x12B6: the pilots of the EV-DO active set.
#pragma once

#include <array>

#include "LogGenerator/C2K/C2KRecord.h"
#include "LogGenerator/EntryList.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::evdoActiveSet {

inline constexpr LogCode logCode = 0x12B6;
inline constexpr std::size_t minimumLength = 25;

inline constexpr std::array layout{Field{.name = "count", .byte = 15}};

inline constexpr std::size_t firstPilot = 25;
inline constexpr std::size_t pilotSize = 12;
inline constexpr std::array pilotLayout{
    Field{.name = "PN offset", .byte = 0, .width = 16},
    Field{.name = "strength", .byte = 2, .width = 16},
};
static_assert(inWireOrder(pilotLayout));
inline constexpr EntryList pilots{
    .count = fieldIn(layout, "count"), .start = firstPilot, .stride = pilotSize, .layout = pilotLayout};

Outcome parse(const C2KUpdate& update);
std::span<const RecordPart> parts();
inline constexpr C2KRecord record{logCode, minimumLength, parse, parts};

}  // namespace kelvasi::evdoActiveSet
