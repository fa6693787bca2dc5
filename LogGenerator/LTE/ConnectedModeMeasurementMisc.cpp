// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/ConnectedModeMeasurementMisc.h"

#include "LogGenerator/LTE/ConnectedModeMeasurement.h"
#include "LogGenerator/LTE/MeasurementScales.h"

namespace kelvasi {

namespace {

using namespace lte;
using connectedModeMeasurement::layout;

constexpr std::array logCodes{connectedModeMeasurement::logCode};

constexpr std::array rows{
    Row{.key = "E-ARFCN", .quantity = quantity::earfcn, .field = indexIn(layout, "E-ARFCN")},
    Row{.key = "Serving Physical Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(layout, "serving physical cell identity")},
    Row{.key = "Subframe Number",
        .quantity = quantity::frameNumber,
        .field = indexIn(layout, "subframe number")},
    Row{.key = "Serving Filtered RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(layout, "filtered RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Serving Filtered RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(layout, "filtered RSRQ"),
        .unit = " dB",
        .scale = eighthRsrq},
};
constexpr std::array records{
    RecordRows{connectedModeMeasurement::logCode, connectedModeMeasurement::minimumLength, layout, rows,
               connectedModeMeasurement::serving},
};

constexpr StateSection section{.name = "Connected mode LTE Intra-frequency Measurement",
                               .trace = "Connected mode LTE Intra-frequency Measurement",
                               .logCodes = logCodes,
                               .records = records,
                               .role = CellRole::serving};

}  // namespace

ConnectedModeMeasurementMisc::ConnectedModeMeasurementMisc(const Platform& platform)
    : StateDecoder(platform, section) {}

}  // namespace kelvasi
