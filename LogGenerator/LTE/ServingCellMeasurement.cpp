// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/ServingCellMeasurement.h"

#include "LogGenerator/LTE/MeasurementScales.h"
#include "LogGenerator/LTE/ServingCellMeasurementRecord.h"

namespace kelvasi {

namespace {

using namespace lte;
using servingCellMeasurement::layout;

constexpr std::array logCodes{servingCellMeasurement::logCode};

constexpr ValueText noPower{64, "Not Present"};
constexpr ValueText noSearch{32, "Not Present"};
constexpr std::array<std::string_view, 2> truth{"False", "True"};

constexpr std::array rows{
    Row{.key = "Version", .quantity = quantity::version, .field = indexIn(layout, "version")},
    Row{.key = "E-ARFCN", .quantity = quantity::earfcn, .field = indexIn(layout, "E-ARFCN")},
    Row{.key = "Physical Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(layout, "physical cell identity")},
    Row{.key = "Serving Layer Priority",
        .quantity = quantity::priority,
        .field = indexIn(layout, "serving layer priority")},
    Row{.key = "Measured RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(layout, "measured RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Average RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(layout, "average RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Measured RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(layout, "measured RSRQ"),
        .unit = " dB",
        .scale = quarterRsrq},
    Row{.key = "Average RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(layout, "average RSRQ"),
        .unit = " dB",
        .scale = quarterRsrq},
    Row{.key = "Measured RSSI",
        .quantity = quantity::rssi,
        .field = indexIn(layout, "measured RSSI"),
        .unit = " dBm",
        .scale = halfRssi},
    Row{.key = "Qrxlevmin",
        .quantity = quantity::qrxlevmin,
        .field = indexIn(layout, "Qrxlevmin"),
        .unit = " dBm",
        .factor = 2,
        .offset = -140},
    Row{.key = "P_Max",
        .quantity = quantity::pMax,
        .field = indexIn(layout, "P-Max"),
        .unit = " dBm",
        .special = noPower,
        .offset = -30},
    // Six bits never reach the value that stands for an absent power.
    Row{.key = "Max UE Tx Power",
        .quantity = quantity::ueTxPower,
        .field = indexIn(layout, "maximum UE transmit power"),
        .unit = " dBm",
        .special = noPower,
        .offset = -30},
    Row{.key = "Srxlev",
        .quantity = quantity::srxlev,
        .field = indexIn(layout, "Srxlev"),
        .unit = " dBm",
        .offset = -30},
    Row{.key = "Num of Consecutive DRX Cycles of S < 0",
        .quantity = quantity::drxCycles,
        .field = indexIn(layout, "DRX cycles with S below 0")},
    Row{.key = "S Intra Search",
        .quantity = quantity::searchThreshold,
        .field = indexIn(layout, "S-IntraSearch"),
        .unit = " dB",
        .special = noSearch,
        .factor = 2},
    // Shown in dBm although it is a difference like the row before it.
    Row{.key = "S Non Intra Search",
        .quantity = quantity::searchThreshold,
        .field = indexIn(layout, "S-NonIntraSearch"),
        .unit = " dBm",
        .special = noSearch,
        .factor = 2},
    Row{.key = "Measurement Rules Updated",
        .quantity = quantity::flag,
        .field = indexIn(layout, "measurement rules updated"),
        .texts = truth},
    Row{.key = "Measurement Rules",
        .quantity = quantity::measurementRules,
        .field = indexIn(layout, "measurement rules")},
};
constexpr std::array records{
    RecordRows{servingCellMeasurement::logCode, servingCellMeasurement::minimumLength, layout, rows,
               servingCellMeasurement::cell},
};

constexpr StateSection section{.name = "Serving Cell Measurements",
                               .trace = "Serving Cell Measurements",
                               .logCodes = logCodes,
                               .records = records,
                               .role = CellRole::serving};

}  // namespace

ServingCellMeasurement::ServingCellMeasurement(const Platform& platform) : StateDecoder(platform, section) {}

}  // namespace kelvasi
