// SPDX-License-Identifier: Apache-2.0
// The names by which the CDMA records address the display.
#pragma once

#include <array>
#include <string_view>

namespace kelvasi::test {

inline constexpr std::array<std::string_view, 30> c2kLookupNames{"kChannel",         "k1xEVDODeviceState",
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
