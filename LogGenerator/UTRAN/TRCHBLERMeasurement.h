// SPDX-License-Identifier: Apache-2.0
// Section "TRCH BLER": the block error rates of the transport channels.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class TRCHBLERMeasurement : public ListDecoder {
 public:
  explicit TRCHBLERMeasurement(const Platform& platform);

 protected:
  // A code that it did not ask for is not worth a line.
  Outcome decodeOther(RecordView, LogCode) override { return Outcome::notAskedFor; }
};

}  // namespace kelvasi
