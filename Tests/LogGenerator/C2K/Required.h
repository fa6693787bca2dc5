// SPDX-License-Identifier: Apache-2.0
// What the CDMA generator is required to ask for, in this order, and the names by which its records address
// the display. Records beyond these may stand anywhere between them.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/LogCode.h"

namespace kelvasi::test {

struct RequiredC2KRecord {
  LogCode logCode;
  std::size_t minimumLength;
  const char* row;  // that the second of two records of zeros fills; none where there is nothing to show
  const char* text;
  bool isExact = false;  // longer ones are refused again
};

inline constexpr std::array requiredC2KRecords{
    RequiredC2KRecord{0x108A, 23, "kFingerC2I", "(none)", true},
    RequiredC2KRecord{0x1183, 50, "kChannel", "259", true},
    RequiredC2KRecord{0x1192, 241, "kFLDataRate", "0.00 kbps"},
    RequiredC2KRecord{0x12B6, 25, "kActiveSetPilots", "(none)"},
    RequiredC2KRecord{0x119C, 17, nullptr, nullptr},
    RequiredC2KRecord{0x119D, 17, nullptr, nullptr},
    RequiredC2KRecord{0x127E, 1750, "kRLDataRate", "0.00 kbps"},
    RequiredC2KRecord{0x134F, 171, "kSystemId", "(unknown system type 0)"},
};

inline constexpr std::array<std::string_view, 30> requiredC2KNames{"kChannel",         "k1xEVDODeviceState",
                                                                   "kBandClass",       "kRxAGC0",
                                                                   "kRxAGC1",          "kTxAGC",
                                                                   "kServingPNOffset", "kSessionState",
                                                                   "kUATI24",          "kColorCode",
                                                                   "kActiveSetPilots", "kFingerC2I",
                                                                   "k1xDeviceState",   "k1xRx0BandClass",
                                                                   "k1xRx0ChanNum",    "k1xRxAGC0",
                                                                   "k1xRx1BandClass",  "k1xRx1ChanNum",
                                                                   "k1xRxAGC1",        "k1xTxAGC",
                                                                   "k1xActiveSetInfo", "k1xTrafficFER",
                                                                   "k1xRoamingHome",   "kSystemId",
                                                                   "kNetworkId",       "kPacketZoneId",
                                                                   "kBaseId",          "kProtocolRevision",
                                                                   "kFLDataRate",      "kRLDataRate"};

}  // namespace kelvasi::test
