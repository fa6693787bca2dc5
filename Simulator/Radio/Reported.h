// SPDX-License-Identifier: Apache-2.0
// What a handset reports of what it receives: the ends of the scales of 3GPP TS 25.133 (9.1.1 and 9.1.2),
// TS 45.008 (8.1.4) and TS 36.133 (9.1.4 and 9.1.7), and what lies beyond them as their end. dBm and dB.
#pragma once

#include <algorithm>

#include "Simulator/Radio/RadioModel.h"

namespace kelvasi::sim {

inline double reportedGsmLevel(const Reception& heard) {
  return std::clamp(heard.level, -111.0, -48.0);
}
inline double reportedRscp(const Reception& heard) {
  return std::clamp(heard.level, -121.0, -25.0);
}
inline double reportedEcNo(const Reception& heard) {
  return std::clamp(heard.ecNo, -24.0, 0.0);
}
inline double reportedRsrp(const Reception& heard) {
  return std::clamp(heard.level, -140.0, -44.0);
}
inline double reportedRsrq(const Reception& heard) {
  return std::clamp(heard.ecNo, -19.5, -3.0);
}

}  // namespace kelvasi::sim
