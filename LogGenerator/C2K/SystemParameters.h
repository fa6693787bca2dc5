// SPDX-License-Identifier: Apache-2.0
// Record 0x134F: identities of the 1x system.
#pragma once

#include <array>

#include "LogGenerator/C2K/C2KRecord.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::systemParameters {

inline constexpr LogCode logCode = 0x134F;
// The base identity stands past this length: a record that the check admits may lack it.
inline constexpr std::size_t minimumLength = 171;
inline constexpr std::int64_t minimumVersion = 2;
inline constexpr std::int64_t cdmaSystem = 2;

inline constexpr std::array layout{
    Field{.name = "version", .byte = 13},
    Field{.name = "roaming indicator", .byte = 42, .width = 32, .isSigned = true},
    Field{.name = "system type", .byte = 46, .width = 32},
    Field{.name = "system identity", .byte = 50, .width = 16},
    Field{.name = "network identity", .byte = 52, .width = 16},
    Field{.name = "packet zone identity", .byte = 131},
    Field{.name = "protocol revision", .byte = 133},
    Field{.name = "base identity", .byte = 184, .width = 16},
};
static_assert(inWireOrder(layout));

Outcome parse(const C2KUpdate& update);
std::span<const RecordPart> parts();
inline constexpr C2KRecord record{logCode, minimumLength, parse, parts, fieldIn(layout, "version").byte};

}  // namespace kelvasi::systemParameters
