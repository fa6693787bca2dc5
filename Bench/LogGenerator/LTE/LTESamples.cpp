// SPDX-License-Identifier: Apache-2.0
#include "Bench/LogGenerator/LTE/LTESamples.h"

#include "LogGenerator/LTE/ConnectedModeMeasurement.h"
#include "LogGenerator/LTE/NeighborMeasurement.h"
#include "LogGenerator/LTE/ReselectionCandidates.h"
#include "LogGenerator/LTE/ServingCell.h"
#include "LogGenerator/LTE/ServingCellMeasurement.h"
#include "LogGenerator/LTE/TransmitAntennas.h"

namespace kelvasi::bench {

using namespace lte;

std::span<const Sample> lteSamples() {
  static constexpr std::array samples{
      Sample{"0xB0C1 antennas", transmitAntennas::logCode, transmitAntennas::minimumLength,
             transmitAntennas::layout},
      Sample{"0xB0C2 serving cell", servingCell::logCode, servingCell::minimumLength, servingCell::layout},
      Sample{"0xB17F serving measurement", servingCellMeasurement::logCode,
             servingCellMeasurement::minimumLength, servingCellMeasurement::layout},
      Sample{.name = "0xB180 6 neighbours",
             .logCode = neighborMeasurement::logCode,
             .length = neighborMeasurement::minimumLength,
             .layout = neighborMeasurement::layout,
             .lists = {{{neighborMeasurement::neighbors, 6}}}},
      Sample{.name = "0xB179 4 measured, 2 detected",
             .logCode = connectedModeMeasurement::logCode,
             .length = connectedModeMeasurement::minimumLength,
             .layout = connectedModeMeasurement::layout,
             .lists = {{{connectedModeMeasurement::measured, 4}, {connectedModeMeasurement::detected, 2}}}},
      Sample{.name = "0xB186 4 candidates",
             .logCode = reselectionCandidates::logCode,
             .length = reselectionCandidates::minimumLength,
             .layout = reselectionCandidates::layout,
             .below = 4,
             .lists = {{{reselectionCandidates::candidates, 4}}}},
  };
  return samples;
}

}  // namespace kelvasi::bench
