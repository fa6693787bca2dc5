// SPDX-License-Identifier: Apache-2.0
// Technology identifiers of the telephony interface: what a daemon answers to "GetTechnology".
#pragma once

#include <string_view>

namespace kelvasi {

inline constexpr std::string_view kTelvonLogChannelTechnology_IFX = "kTelvonLogChannelTechnology_IFX";
inline constexpr std::string_view kTelvonLogChannelTechnology_Orvane_GSM =
    "kTelvonLogChannelTechnology_Orvane_GSM";
inline constexpr std::string_view kTelvonLogChannelTechnology_Orvane_CDMA =
    "kTelvonLogChannelTechnology_Orvane_CDMA";
inline constexpr std::string_view kTelvonLogChannelTechnology_Orvane_LTE =
    "kTelvonLogChannelTechnology_Orvane_LTE";
inline constexpr std::string_view kTelvonLogChannelTechnology_Orvane_UTRAN2 =
    "kTelvonLogChannelTechnology_Orvane_UTRAN2";

}  // namespace kelvasi
