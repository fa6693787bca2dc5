// SPDX-License-Identifier: Apache-2.0
// Section "UMTS RR Measurement": asks for no records, so it shows what the template holds.
#pragma once

#include "LogGenerator/RecordlessDecoder.h"

namespace kelvasi {

class UMTSRRMeasurement : public RecordlessDecoder {
 public:
  explicit UMTSRRMeasurement(const Platform& platform);
};

}  // namespace kelvasi
