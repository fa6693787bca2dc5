// SPDX-License-Identifier: Apache-2.0
// Record 0x119D: whether a frame of the 1x traffic channel was received in error.
#pragma once

#include <array>
#include <optional>

#include "LogGenerator/C2K/C2KRecord.h"
#include "LogGenerator/C2K/SubPackets.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"
#include "LogGenerator/Row.h"
#include "Plist/PlistValue.h"

namespace kelvasi::trafficFER {

inline constexpr LogCode logCode = 0x119D;

inline constexpr std::int64_t demodulationId = 11;
inline constexpr std::array demodulationLayout{Field{.name = "frame error", .byte = 24}};

inline constexpr float newFrameWeight = 0.015625F;  // 1/64
inline constexpr float oldRateWeight = 0.984375F;

// In percent.
inline constexpr Row rateRow{.key = "k1xTrafficFER",
                             .quantity = quantity::fer,
                             .unit = "%",
                             .scale = Scale{.format = "%.02f", .curve = fromRaw}};
// Of a call that has ended: no measurement any more.
inline constexpr Row oldRateRow{.key = "k1xTrafficFER",
                                .quantity = quantity::fer,
                                .unit = "% (old)",
                                .scale = Scale{.format = "%.02f", .curve = fromRaw},
                                .hasNumber = false};

// The smoothed rate that the state keeps, 1 when every frame is in error; nothing before the first frame of
// a call. Shown in percent.
std::optional<double> rateOf(const PlistDictionary& state);
constexpr double percent(double rate) {
  return rate * 100;
}

Outcome parse(const C2KUpdate& update);
std::span<const RecordPart> parts();
inline constexpr C2KRecord record{logCode, subPackets::minimumLength, parse, parts};

}  // namespace kelvasi::trafficFER
