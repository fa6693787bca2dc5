// SPDX-License-Identifier: Apache-2.0
// Which cells of the telephony daemon's list the tables of GSM/UMTS show, and how.
#pragma once

#include <array>
#include <string_view>

#include "LogGenerator/Daemon/CellRows.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi::daemonCells {

inline constexpr std::array gsm{kTelvonCellMonitorRadioAccessTechnologyGSM};
inline constexpr std::array umts{kTelvonCellMonitorRadioAccessTechnologyUMTS};

inline constexpr std::array gsmServingRows{
    CellRow{{.key = "Cell ID", .quantity = quantity::cellId},
            kTelvonCellMonitorCellId,
            "GSMServingCell: Failed to retrieve Cell ID\n"},
    CellRow{{.key = "ARFCN", .quantity = quantity::arfcn},
            kTelvonCellMonitorARFCN,
            "GSMServingCell: Failed to retrieve ARFCN\n"},
};
inline constexpr CellTable gsmServing{
    gsm, kTelvonCellMonitorCellTypeServing, gsmServingRows, {RadioFamily::gsm, kTelvonCellMonitorARFCN}};

// Unit and key of the frequency differ from those of record 0x4005.
inline constexpr std::array umtsNeighbourRows{
    CellRow{{.key = "UARFCN", .quantity = quantity::uarfcn},
            kTelvonCellMonitorUARFCN,
            "UMTSSet: Failed to retrieve UARFCN\n"},
    CellRow{{.key = "Scrambling Code", .quantity = quantity::scramblingCode},
            kTelvonCellMonitorSCN,
            "UMTSSet: Failed to retrieve Scrambling Code\n"},
    CellRow{{.key = "RSCP", .quantity = quantity::rscp, .unit = " dBm", .special = emptyIfNotMeasured},
            kTelvonCellMonitorRSCP,
            "UMTSSet: Failed to retrieve RSCP\n"},
    CellRow{
        {.key = "Energy Per Chip", .quantity = quantity::ecno, .unit = " dB", .special = emptyIfNotMeasured},
        kTelvonCellMonitorECN0,
        "UMTSSet: Failed to retrieve Energy Per Chip\n"},
};
inline constexpr CellTable umtsNeighbours{
    umts,
    kTelvonCellMonitorCellTypeNeighbor,
    umtsNeighbourRows,
    {RadioFamily::umts, kTelvonCellMonitorUARFCN, kTelvonCellMonitorSCN}};

}  // namespace kelvasi::daemonCells
