// SPDX-License-Identifier: Apache-2.0
// Section "GSM Neighbor Cell List": stays empty, whatever the GSM neighbour record says.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class GSMNeighbhorMeasurements : public ListDecoder {
 public:
  explicit GSMNeighbhorMeasurements(const Platform& platform);

 protected:
  // A code that it did not ask for is not worth a line.
  Outcome decodeOther(RecordView, LogCode) override { return Outcome::notAskedFor; }
};

}  // namespace kelvasi
