// SPDX-License-Identifier: Apache-2.0
// Record 0x108A: carrier to interference of the rake receiver's fingers.
#pragma once

#include <array>

#include "LogGenerator/C2K/C2KRecord.h"
#include "LogGenerator/EntryList.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::fingers {

inline constexpr LogCode logCode = 0x108A;
inline constexpr std::size_t minimumLength = 23;

inline constexpr std::array layout{Field{.name = "count", .byte = 22}};

inline constexpr std::size_t firstFinger = 23;
inline constexpr std::size_t fingerSize = 14;
inline constexpr std::array fingerLayout{
    Field{.name = "PN offset", .byte = 0, .width = 16},
    Field{.name = "C/I", .byte = 6, .width = 16},
};
static_assert(inWireOrder(fingerLayout));
inline constexpr EntryList all{
    .count = fieldIn(layout, "count"), .start = firstFinger, .stride = fingerSize, .layout = fingerLayout};

Outcome parse(const C2KUpdate& update);
std::span<const RecordPart> parts();
inline constexpr C2KRecord record{logCode, minimumLength, parse, parts};

}  // namespace kelvasi::fingers
