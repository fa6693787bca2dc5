// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/DetectedCells.h"

#include "LogGenerator/LTE/ConnectedModeMeasurement.h"

namespace kelvasi {

namespace {

using namespace lte;

constexpr std::array logCodes{connectedModeMeasurement::logCode};

constexpr std::array rows{
    Row{.key = "Physical Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(connectedModeMeasurement::detectedLayout, "physical cell identity")},
};

constexpr ListSection section{.name = "Detected Cells",
                              .trace = "Detected Cells",
                              .logCodes = logCodes,
                              .logCode = connectedModeMeasurement::logCode,
                              .minimumLength = connectedModeMeasurement::minimumLength,
                              .list = connectedModeMeasurement::detected,
                              .rows = rows,
                              .role = CellRole::neighbour,
                              .cell = connectedModeMeasurement::detectedCell};

}  // namespace

DetectedCells::DetectedCells(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
