// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/MeasuredNeighborCells.h"

#include "LogGenerator/LTE/ConnectedModeMeasurement.h"
#include "LogGenerator/LTE/MeasurementScales.h"

namespace kelvasi {

namespace {

using namespace lte;
using connectedModeMeasurement::measuredLayout;

constexpr std::array logCodes{connectedModeMeasurement::logCode};

constexpr std::array rows{
    Row{.key = "Physical Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(measuredLayout, "physical cell identity")},
    Row{.key = "Filtered RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(measuredLayout, "filtered RSRP"),
        .unit = " dBm",
        .scale = quarterRsrp},
    Row{.key = "Filtered RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(measuredLayout, "filtered RSRQ"),
        .unit = " dB",
        .scale = eighthRsrq},
};

constexpr ListSection section{.name = "Measured Neighbor Cells",
                              .trace = "Measured Neighbor Cells",
                              .logCodes = logCodes,
                              .logCode = connectedModeMeasurement::logCode,
                              .minimumLength = connectedModeMeasurement::minimumLength,
                              .list = connectedModeMeasurement::measured,
                              .rows = rows,
                              .role = CellRole::neighbour,
                              .cell = connectedModeMeasurement::measuredCell};

}  // namespace

MeasuredNeighborCells::MeasuredNeighborCells(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
