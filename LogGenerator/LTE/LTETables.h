// SPDX-License-Identifier: Apache-2.0
// The sections of LTE whose decoder is a table and nothing else. The records' own files have the rows.
#pragma once

#include <array>

#include "LogGenerator/LTE/ConnectedModeMeasurement.h"
#include "LogGenerator/LTE/NeighborMeasurement.h"
#include "LogGenerator/LTE/ReselectionCandidates.h"
#include "LogGenerator/LTE/ServingCellMeasurement.h"
#include "LogGenerator/ListDecoder.h"
#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

namespace lteTables {

using namespace lte;

// The serving cell as measured in idle mode.
inline constexpr std::array idleCodes{servingCellMeasurement::logCode};
inline constexpr std::array idleRecords{servingCellMeasurement::record};
inline constexpr StateSection idleMeasurement{.name = "Serving Cell Measurements",
                                              .trace = "Serving Cell Measurements",
                                              .logCodes = idleCodes,
                                              .records = idleRecords,
                                              .role = CellRole::serving};

// What the neighbour cells of an idle-mode measurement have in common.
inline constexpr std::array neighborCodes{neighborMeasurement::logCode};
inline constexpr std::array neighborRecords{neighborMeasurement::record};
inline constexpr StateSection neighborMeasurements{.name = "Neighbor Measurements",
                                                   .trace = "Neighbor Measurements",
                                                   .logCodes = neighborCodes,
                                                   .records = neighborRecords,
                                                   .role = CellRole::neighbour};

// The cell from which reselection looks for candidates.
inline constexpr std::array reselectionCodes{reselectionCandidates::logCode};
inline constexpr std::array reselectionRecords{reselectionCandidates::servingRecord};
inline constexpr StateSection reselection{.name = "Reselection Candidates",
                                          .trace = "Reselection Candidates",
                                          .logCodes = reselectionCodes,
                                          .records = reselectionRecords,
                                          .role = CellRole::serving};

// The serving cell, the measured neighbours and those that were only detected in connected mode.
inline constexpr std::array connectedCodes{connectedModeMeasurement::logCode};
inline constexpr std::array connectedRecords{connectedModeMeasurement::record};
inline constexpr StateSection connectedMeasurement{.name = "Connected mode LTE Intra-frequency Measurement",
                                                   .trace = "Connected mode LTE Intra-frequency Measurement",
                                                   .logCodes = connectedCodes,
                                                   .records = connectedRecords,
                                                   .role = CellRole::serving};
inline constexpr ListSection measuredCells{.name = "Measured Neighbor Cells",
                                           .trace = "Measured Neighbor Cells",
                                           .logCodes = connectedCodes,
                                           .logCode = connectedModeMeasurement::logCode,
                                           .minimumLength = connectedModeMeasurement::minimumLength,
                                           .list = connectedModeMeasurement::measured,
                                           .rows = connectedModeMeasurement::measuredRows,
                                           .role = CellRole::neighbour,
                                           .cell = connectedModeMeasurement::measuredCell};
inline constexpr ListSection detectedCells{.name = "Detected Cells",
                                           .trace = "Detected Cells",
                                           .logCodes = connectedCodes,
                                           .logCode = connectedModeMeasurement::logCode,
                                           .minimumLength = connectedModeMeasurement::minimumLength,
                                           .list = connectedModeMeasurement::detected,
                                           .rows = connectedModeMeasurement::detectedRows,
                                           .role = CellRole::neighbour,
                                           .cell = connectedModeMeasurement::detectedCell};

}  // namespace lteTables

using ConnectedModeMeasurementMisc = StateTable<lteTables::connectedMeasurement>;
using DetectedCells = ListTable<lteTables::detectedCells>;
using MeasuredNeighborCells = ListTable<lteTables::measuredCells>;
using NeighborMeasurementMisc = StateTable<lteTables::neighborMeasurements>;
using ReselectionCandidatesMisc = StateTable<lteTables::reselection>;
using ServingCellMeasurement = StateTable<lteTables::idleMeasurement>;

}  // namespace kelvasi
