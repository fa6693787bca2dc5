// SPDX-License-Identifier: Apache-2.0
// Section "Detected Cells": the cells detected and not measured in connected mode.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class DetectedCells : public ListDecoder {
 public:
  explicit DetectedCells(const Platform& platform);
};

}  // namespace kelvasi
