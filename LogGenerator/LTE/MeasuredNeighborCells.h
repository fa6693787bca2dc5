// SPDX-License-Identifier: Apache-2.0
// Section "Measured Neighbor Cells": the neighbour cells measured in connected mode.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class MeasuredNeighborCells : public ListDecoder {
 public:
  explicit MeasuredNeighborCells(const Platform& platform);
};

}  // namespace kelvasi
