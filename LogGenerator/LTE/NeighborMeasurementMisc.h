// SPDX-License-Identifier: Apache-2.0
// Section "Neighbor Measurements": what the neighbour cells of a measurement have in common.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class NeighborMeasurementMisc : public StateDecoder {
 public:
  explicit NeighborMeasurementMisc(const Platform& platform);
};

}  // namespace kelvasi
