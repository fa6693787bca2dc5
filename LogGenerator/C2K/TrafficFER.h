// Record 0x119D: whether a frame of the 1x traffic channel was received in error.
#pragma once

#include <array>

#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi::trafficFER {

inline constexpr LogCode logCode = 0x119D;

inline constexpr std::int64_t demodulationId = 11;
inline constexpr std::array demodulationLayout{Field{.name = "frame error", .byte = 24}};

inline constexpr float newFrameWeight = 0.015625F;  // 1/64
inline constexpr float oldRateWeight = 0.984375F;

}  // namespace kelvasi::trafficFER
