#include "LogGenerator/GSM/GSMServingCell.h"

#include "LogGenerator/GSM/GSMCellRecords.h"
#include "LogGenerator/GSM/GSMMeasurements.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{gsmCellIdentity::logCode, gsmMeasurements::logCode, dedicatedChannel::logCode,
                              cellInfoLogCode};

// C1 and C2 (3GPP TS 45.008, 6.4) are the low halves of their words.
constexpr std::array measurementRows{
    Row{.key = "RSSI", .field = indexIn(gsmMeasurements::layout, "receive level"), .unit = " dBm"},
    Row{.key = "C1 Value",
        .field = indexIn(gsmMeasurements::layout, "C1 or full receive quality"),
        .lowBits = 16},
    Row{.key = "C2 Value",
        .field = indexIn(gsmMeasurements::layout, "C2 or sub receive quality"),
        .lowBits = 16},
};
constexpr std::array records{
    gsmCellIdentity::record,
    RecordRows{gsmMeasurements::logCode, gsmMeasurements::minimumLength, gsmMeasurements::layout,
               measurementRows},
    dedicatedChannel::record,
};

constexpr std::array cellRows{
    CellRow{"Cell ID", kTelvonCellMonitorCellId, "GSMServingCell: Failed to retrieve Cell ID\n"},
    CellRow{"ARFCN", kTelvonCellMonitorARFCN, "GSMServingCell: Failed to retrieve ARFCN\n"},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyGSM};
constexpr CellTable servingCell{technologies, kTelvonCellMonitorCellTypeServing, cellRows};

constexpr StateSection section{.name = "GSM Serving Cell",
                               .trace = "GSMServingCell",
                               .logCodes = logCodes,
                               .records = records,
                               .cells = &servingCell};

}  // namespace

GSMServingCell::GSMServingCell(const Platform& platform) : StateDecoder(platform, section) {}

}  // namespace kelvasi
