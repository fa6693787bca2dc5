// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/UMTSSet.h"

#include "LogGenerator/GSM/NeighbourSets.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

namespace {

using namespace neighbourSets;

constexpr std::array logCodes{neighbourSets::logCode, cellInfoLogCode};
constexpr std::array rows{
    Row{.key = "Scrambling Code",
        .quantity = quantity::scramblingCode,
        .field = indexIn(umtsLayout, "scrambling code")},
    Row{.key = "RSCP",
        .quantity = quantity::rscp,
        .field = indexIn(umtsLayout, "RSCP"),
        .unit = " dB",
        .offset = -21},
    Row{.key = "Energy Per Chip",
        .quantity = quantity::ecno,
        .field = indexIn(umtsLayout, "Ec/No in half dB"),
        .unit = " dB",
        .scale = Scale{.factor = 0.5, .format = "%f"}},
    Row{.key = "Downlink Frequency",
        .quantity = quantity::uarfcn,
        .field = indexIn(umtsLayout, "downlink UARFCN")},
    Row{.key = "Ranking Value", .quantity = quantity::ranking, .field = indexIn(umtsLayout, "ranking value")},
    Row{.key = "Rank Cell RSCP",
        .quantity = quantity::rscp,
        .field = indexIn(umtsLayout, "rank-cell RSCP"),
        .unit = " dB"},
};

// Unit and key of the frequency differ from the rows above.
constexpr std::array cellRows{
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
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyUMTS};
constexpr CellTable neighbours{technologies,
                               kTelvonCellMonitorCellTypeNeighbor,
                               cellRows,
                               {RadioFamily::umts, kTelvonCellMonitorUARFCN, kTelvonCellMonitorSCN}};

constexpr ListSection section{.name = "UMTS Set",
                              .trace = "UMTSSet",
                              .logCodes = logCodes,
                              .logCode = neighbourSets::logCode,
                              .minimumLength = minimumLength,
                              .list = umtsCells,
                              .rows = rows,
                              .cells = &neighbours,
                              .role = CellRole::neighbour,
                              .cell = umtsCell};

}  // namespace

UMTSSet::UMTSSet(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
