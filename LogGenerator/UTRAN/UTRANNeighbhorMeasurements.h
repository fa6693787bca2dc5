// SPDX-License-Identifier: Apache-2.0
// Section "Neighbor Cell List": the UTRAN neighbour cells.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class UTRANNeighbhorMeasurements : public ListDecoder {
 public:
  explicit UTRANNeighbhorMeasurements(const Platform& platform);

 protected:
  void addEntry(RecordView record, std::size_t place) override;
};

}  // namespace kelvasi
