// SPDX-License-Identifier: Apache-2.0
// How the measurements of LTE records are scaled (ranges after 3GPP TS 36.133, 9.1). The records do not agree
// on the steps: each names its own.
#pragma once

#include "LogGenerator/Row.h"

namespace kelvasi::lte {

inline constexpr Scale quarterRsrp{.factor = 0.25, .offset = -140};
inline constexpr Scale halfRsrp{.factor = 0.5, .offset = -140};
inline constexpr Scale quarterRsrq{.factor = 0.25, .offset = -30};
inline constexpr Scale eighthRsrq{.factor = 0.125, .offset = -20};
inline constexpr Scale halfRssi{.factor = 0.5, .offset = -140};

}  // namespace kelvasi::lte
