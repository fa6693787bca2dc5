#include "LogGenerator/LTE/ConnectedModeMeasurementMisc.h"

#include "LogGenerator/LTE/ConnectedModeMeasurement.h"
#include "LogGenerator/LTE/MeasurementScales.h"

namespace kelvasi {

namespace {

using namespace lte;
using connectedModeMeasurement::layout;

constexpr std::array logCodes{connectedModeMeasurement::logCode};

constexpr std::array rows{
    Row{.key = "E-ARFCN", .field = indexIn(layout, "E-ARFCN")},
    Row{.key = "Serving Physical Cell ID", .field = indexIn(layout, "serving physical cell identity")},
    Row{.key = "Subframe Number", .field = indexIn(layout, "subframe number")},
    Row{.key = "Serving Filtered RSRP",
        .field = indexIn(layout, "filtered RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Serving Filtered RSRQ",
        .field = indexIn(layout, "filtered RSRQ"),
        .unit = " dB",
        .scale = eighthRsrq},
};
constexpr std::array records{
    RecordRows{connectedModeMeasurement::logCode, connectedModeMeasurement::minimumLength, layout, rows},
};

constexpr StateSection section{.name = "Connected mode LTE Intra-frequency Measurement",
                               .trace = "Connected mode LTE Intra-frequency Measurement",
                               .logCodes = logCodes,
                               .records = records};

}  // namespace

ConnectedModeMeasurementMisc::ConnectedModeMeasurementMisc(const Platform& platform)
    : StateDecoder(platform, section) {}

}  // namespace kelvasi
