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
    Row{.key = "Version", .field = indexIn(layout, "version")},
    Row{.key = "E-ARFCN", .field = indexIn(layout, "E-ARFCN")},
    Row{.key = "Physical Cell ID", .field = indexIn(layout, "physical cell identity")},
    Row{.key = "Serving Layer Priority", .field = indexIn(layout, "serving layer priority")},
    Row{.key = "Measured RSRP",
        .field = indexIn(layout, "measured RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Average RSRP",
        .field = indexIn(layout, "average RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Measured RSRQ",
        .field = indexIn(layout, "measured RSRQ"),
        .unit = " dB",
        .scale = quarterRsrq},
    Row{.key = "Average RSRQ", .field = indexIn(layout, "average RSRQ"), .unit = " dB", .scale = quarterRsrq},
    Row{.key = "Measured RSSI", .field = indexIn(layout, "measured RSSI"), .unit = " dBm", .scale = halfRssi},
    Row{.key = "Qrxlevmin",
        .field = indexIn(layout, "Qrxlevmin"),
        .unit = " dBm",
        .factor = 2,
        .offset = -140},
    Row{.key = "P_Max", .field = indexIn(layout, "P-Max"), .unit = " dBm", .special = noPower, .offset = -30},
    // Six bits never reach the value that stands for an absent power.
    Row{.key = "Max UE Tx Power",
        .field = indexIn(layout, "maximum UE transmit power"),
        .unit = " dBm",
        .special = noPower,
        .offset = -30},
    Row{.key = "Srxlev", .field = indexIn(layout, "Srxlev"), .unit = " dBm", .offset = -30},
    Row{.key = "Num of Consecutive DRX Cycles of S < 0",
        .field = indexIn(layout, "DRX cycles with S below 0")},
    Row{.key = "S Intra Search",
        .field = indexIn(layout, "S-IntraSearch"),
        .unit = " dB",
        .special = noSearch,
        .factor = 2},
    // Shown in dBm although it is a difference like the row before it.
    Row{.key = "S Non Intra Search",
        .field = indexIn(layout, "S-NonIntraSearch"),
        .unit = " dBm",
        .special = noSearch,
        .factor = 2},
    Row{.key = "Measurement Rules Updated",
        .field = indexIn(layout, "measurement rules updated"),
        .texts = truth},
    Row{.key = "Measurement Rules", .field = indexIn(layout, "measurement rules")},
};
constexpr std::array records{
    RecordRows{servingCellMeasurement::logCode, servingCellMeasurement::minimumLength, layout, rows},
};

constexpr StateSection section{.name = "Serving Cell Measurements",
                               .trace = "Serving Cell Measurements",
                               .logCodes = logCodes,
                               .records = records};

}  // namespace

ServingCellMeasurement::ServingCellMeasurement(const Platform& platform) : StateDecoder(platform, section) {}

}  // namespace kelvasi
