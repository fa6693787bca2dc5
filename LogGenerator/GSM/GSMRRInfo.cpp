// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMRRInfo.h"

#include "LogGenerator/GSM/GPRSCellOptions.h"
#include "LogGenerator/GSM/GSMMeasurements.h"
#include "LogGenerator/GSM/GSMRRRecords.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{rrState::logCode, gsmMeasurements::logCode, dtx::logCode,
                              gprsCellOptions::logCode};

// Whole words, of which the serving cell's section shows the low halves as C1 and C2.
constexpr std::array measurementRows{
    Row{.key = "Serving Rx Level",
        .quantity = quantity::rxlev,
        .field = indexIn(gsmMeasurements::layout, "receive level")},
    Row{.key = "Rx Quality Full",
        .quantity = quantity::rxqual,
        .field = indexIn(gsmMeasurements::layout, "C1 or full receive quality")},
    Row{.key = "Rx Quality Sub",
        .quantity = quantity::rxqual,
        .field = indexIn(gsmMeasurements::layout, "C2 or sub receive quality")},
};
constexpr std::array optionRows{
    Row{.key = "DRX Used",
        .quantity = quantity::drxTimer,
        .field = indexIn(gprsCellOptions::layout, "DRX timer maximum"),
        .unit = " sec"},
};
constexpr std::array records{
    rrState::record,
    RecordRows{gsmMeasurements::logCode, gsmMeasurements::minimumLength, gsmMeasurements::layout,
               measurementRows, gsmMeasurements::servingCell},
    dtx::record,
    RecordRows{gprsCellOptions::logCode, gprsCellOptions::minimumLength, gprsCellOptions::layout, optionRows},
};

constexpr StateSection section{.name = "GSM RR Info",
                               .trace = "GSMRRInfo",
                               .logCodes = logCodes,
                               .records = records,
                               .role = CellRole::serving};

}  // namespace

GSMRRInfo::GSMRRInfo(const Platform& platform) : StateDecoder(platform, section) {}

}  // namespace kelvasi
