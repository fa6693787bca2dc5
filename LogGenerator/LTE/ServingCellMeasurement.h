// SPDX-License-Identifier: Apache-2.0
// Section "Serving Cell Measurements": the serving cell as measured in idle mode.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class ServingCellMeasurement : public StateDecoder {
 public:
  explicit ServingCellMeasurement(const Platform& platform);
};

}  // namespace kelvasi
