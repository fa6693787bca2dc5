#include "LogGenerator/GSM/UMTSSet.h"

#include "LogGenerator/GSM/NeighbourSets.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

namespace {

using namespace neighbourSets;

constexpr std::array logCodes{neighbourSets::logCode, cellInfoLogCode};
constexpr std::array rows{
    Row{.key = "Scrambling Code", .field = indexIn(umtsLayout, "scrambling code")},
    Row{.key = "RSCP", .field = indexIn(umtsLayout, "RSCP"), .unit = " dB", .offset = -21},
    Row{.key = "Energy Per Chip",
        .field = indexIn(umtsLayout, "Ec/No in half dB"),
        .unit = " dB",
        .scale = Scale{.factor = 0.5, .format = "%f"}},
    Row{.key = "Downlink Frequency", .field = indexIn(umtsLayout, "downlink UARFCN")},
    Row{.key = "Ranking Value", .field = indexIn(umtsLayout, "ranking value")},
    Row{.key = "Rank Cell RSCP", .field = indexIn(umtsLayout, "rank-cell RSCP"), .unit = " dB"},
};

// Unit and key of the frequency differ from the rows above.
constexpr std::array cellRows{
    CellRow{"UARFCN", kTelvonCellMonitorUARFCN, "UMTSSet: Failed to retrieve UARFCN\n"},
    CellRow{"Scrambling Code", kTelvonCellMonitorSCN, "UMTSSet: Failed to retrieve Scrambling Code\n"},
    CellRow{.key = "RSCP",
            .cellKey = kTelvonCellMonitorRSCP,
            .failure = "UMTSSet: Failed to retrieve RSCP\n",
            .unit = " dBm",
            .isMeasurement = true},
    CellRow{.key = "Energy Per Chip",
            .cellKey = kTelvonCellMonitorECN0,
            .failure = "UMTSSet: Failed to retrieve Energy Per Chip\n",
            .unit = " dB",
            .isMeasurement = true},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyUMTS};
constexpr CellTable neighbours{technologies, kTelvonCellMonitorCellTypeNeighbor, cellRows};

constexpr ListSection section{.name = "UMTS Set",
                              .trace = "UMTSSet",
                              .logCodes = logCodes,
                              .logCode = neighbourSets::logCode,
                              .minimumLength = minimumLength,
                              .list = umtsCells,
                              .rows = rows,
                              .cells = &neighbours};

}  // namespace

UMTSSet::UMTSSet(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
