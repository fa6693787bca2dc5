// SPDX-License-Identifier: Apache-2.0
// Records 0x1192 and 0x127E: packet counters of the EV-DO forward and reverse links, from which the data
// rates follow.
#pragma once

#include <array>

#include "LogGenerator/C2K/C2KRecord.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi {

namespace evdoForwardRate {

inline constexpr LogCode logCode = 0x1192;
inline constexpr std::size_t minimumLength = 241;
inline constexpr std::array layout{Field{.name = "sequence number", .byte = 13, .width = 32}};

inline constexpr std::size_t firstCounter = 17;
// Bits of a packet, by counter.
inline constexpr std::array<std::int64_t, 56> weights{
    128,  256,  512, 1024, 0,    128,  256,  512,  1024, 0,    128,  256,  512,  1024,
    0,    128,  256, 512,  1024, 0,    128,  256,  512,  1024, 0,    512,  1024, 2048,
    0,    128,  256, 512,  1024, 0,    512,  1024, 2048, 0,    1024, 3072, 0,    512,
    1024, 2048, 0,   4096, 0,    1024, 3072, 0,    4096, 0,    5120, 0,    5120, 0};

Outcome parse(const C2KUpdate& update);
std::span<const RecordPart> parts();
inline constexpr C2KRecord record{logCode, minimumLength, parse, parts};

}  // namespace evdoForwardRate

namespace evdoReverseRate {

inline constexpr LogCode logCode = 0x127E;
inline constexpr std::size_t minimumLength = 1750;
inline constexpr std::array layout{Field{.name = "sequence number", .byte = 14, .width = 32}};

inline constexpr std::size_t firstCounter = 18;
// A counter's place is the sum of its steps: three sub-frames of two halves of twelve rates of four counters.
inline constexpr std::size_t subFrames = 3;
inline constexpr std::size_t subFrameStep = 576;
inline constexpr std::size_t halves = 2;
inline constexpr std::size_t halfStep = 288;
inline constexpr std::size_t rateStep = 24;
inline constexpr std::size_t counters = 4;
inline constexpr std::size_t counterStep = 4;
// Bits of a packet, by rate.
inline constexpr std::array<std::int64_t, 12> weights{128,  256,  512,  768,  1024, 1536,
                                                      2048, 3072, 4096, 6144, 8192, 12288};

Outcome parse(const C2KUpdate& update);
std::span<const RecordPart> parts();
inline constexpr C2KRecord record{logCode, minimumLength, parse, parts};

}  // namespace evdoReverseRate

}  // namespace kelvasi
