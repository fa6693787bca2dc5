// Section "GSM Neighbor Cell List": stays empty, whatever the GSM neighbour record says.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class GSMNeighbhorMeasurements : public ListDecoder {
 public:
  explicit GSMNeighbhorMeasurements(const Platform& platform);

 protected:
  // A code that it did not ask for is not worth a line.
  void decodeOther(RecordView, LogCode) override {}
};

}  // namespace kelvasi
