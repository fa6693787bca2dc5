// SPDX-License-Identifier: Apache-2.0
// Keys and values of the cell dictionaries in the telephony daemon's cell list.
#pragma once

#include <string_view>

namespace kelvasi {

inline constexpr std::string_view kTelvonCellMonitorCellRadioAccessTechnology =
    "kTelvonCellMonitorCellRadioAccessTechnology";
inline constexpr std::string_view kTelvonCellMonitorCellType = "kTelvonCellMonitorCellType";

inline constexpr std::string_view kTelvonCellMonitorMCC = "kTelvonCellMonitorMCC";
inline constexpr std::string_view kTelvonCellMonitorMNC = "kTelvonCellMonitorMNC";
inline constexpr std::string_view kTelvonCellMonitorLAC = "kTelvonCellMonitorLAC";
inline constexpr std::string_view kTelvonCellMonitorTAC = "kTelvonCellMonitorTAC";
inline constexpr std::string_view kTelvonCellMonitorCellId = "kTelvonCellMonitorCellId";
inline constexpr std::string_view kTelvonCellMonitorPID = "kTelvonCellMonitorPID";
inline constexpr std::string_view kTelvonCellMonitorBandInfo = "kTelvonCellMonitorBandInfo";
inline constexpr std::string_view kTelvonCellMonitorARFCN = "kTelvonCellMonitorARFCN";
inline constexpr std::string_view kTelvonCellMonitorUARFCN = "kTelvonCellMonitorUARFCN";
inline constexpr std::string_view kTelvonCellMonitorSCN = "kTelvonCellMonitorSCN";
inline constexpr std::string_view kTelvonCellMonitorRSCP = "kTelvonCellMonitorRSCP";
inline constexpr std::string_view kTelvonCellMonitorECN0 = "kTelvonCellMonitorECN0";
inline constexpr std::string_view kTelvonCellMonitorRSSI = "kTelvonCellMonitorRSSI";

inline constexpr std::string_view kTelvonCellMonitorRadioAccessTechnologyGSM =
    "kTelvonCellMonitorRadioAccessTechnologyGSM";
inline constexpr std::string_view kTelvonCellMonitorRadioAccessTechnologyUMTS =
    "kTelvonCellMonitorRadioAccessTechnologyUMTS";
inline constexpr std::string_view kTelvonCellMonitorRadioAccessTechnologyUTRAN2 =
    "kTelvonCellMonitorRadioAccessTechnologyUTRAN2";
inline constexpr std::string_view kTelvonCellMonitorRadioAccessTechnologyLTE =
    "kTelvonCellMonitorRadioAccessTechnologyLTE";

inline constexpr std::string_view kTelvonCellMonitorCellTypeServing = "kTelvonCellMonitorCellTypeServing";
inline constexpr std::string_view kTelvonCellMonitorCellTypeNeighbor = "kTelvonCellMonitorCellTypeNeighbor";

}  // namespace kelvasi
