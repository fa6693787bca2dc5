// SPDX-License-Identifier: Apache-2.0
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
    Row{.key = "RSSI",
        .quantity = quantity::rxlev,
        .field = indexIn(gsmMeasurements::layout, "receive level"),
        .unit = " dBm"},
    Row{.key = "C1 Value",
        .quantity = quantity::c1,
        .field = indexIn(gsmMeasurements::layout, "C1 or full receive quality"),
        .lowBits = 16,
        .isSignedNumber = true},
    Row{.key = "C2 Value",
        .quantity = quantity::c2,
        .field = indexIn(gsmMeasurements::layout, "C2 or sub receive quality"),
        .lowBits = 16,
        .isSignedNumber = true},
};
constexpr std::array records{
    gsmCellIdentity::record,
    RecordRows{gsmMeasurements::logCode, gsmMeasurements::minimumLength, gsmMeasurements::layout,
               measurementRows, gsmMeasurements::servingCell},
    dedicatedChannel::record,
};

constexpr std::array cellRows{
    CellRow{{.key = "Cell ID", .quantity = quantity::cellId},
            kTelvonCellMonitorCellId,
            "GSMServingCell: Failed to retrieve Cell ID\n"},
    CellRow{{.key = "ARFCN", .quantity = quantity::arfcn},
            kTelvonCellMonitorARFCN,
            "GSMServingCell: Failed to retrieve ARFCN\n"},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyGSM};
constexpr CellTable servingCell{
    technologies, kTelvonCellMonitorCellTypeServing, cellRows, {RadioFamily::gsm, kTelvonCellMonitorARFCN}};

constexpr StateSection section{.name = "GSM Serving Cell",
                               .trace = "GSMServingCell",
                               .logCodes = logCodes,
                               .records = records,
                               .cells = &servingCell,
                               .role = CellRole::serving};

}  // namespace

GSMServingCell::GSMServingCell(const Platform& platform) : StateDecoder(platform, section) {}

}  // namespace kelvasi
