// Section "TRCH BLER": the block error rates of the transport channels.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class TRCHBLERMeasurement : public ListDecoder {
 public:
  explicit TRCHBLERMeasurement(const Platform& platform);

 protected:
  // A code that it did not ask for is not worth a line.
  void decodeOther(RecordView, LogCode) override {}
};

}  // namespace kelvasi
