// SPDX-License-Identifier: Apache-2.0
// Section "Connected mode LTE Intra-frequency Measurement": the serving cell as measured in connected mode.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class ConnectedModeMeasurementMisc : public StateDecoder {
 public:
  explicit ConnectedModeMeasurementMisc(const Platform& platform);
};

}  // namespace kelvasi
