// SPDX-License-Identifier: Apache-2.0
// Section "CCTRCH SIR": the signal-to-interference ratios of the coded composite channels.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class CCTRCHSIRMeasurement : public ListDecoder {
 public:
  explicit CCTRCHSIRMeasurement(const Platform& platform);

 protected:
  void addEntry(RecordView record, std::size_t place) override;
  // A code that it did not ask for is not worth a line.
  Outcome decodeOther(RecordView, LogCode) override { return Outcome::notAskedFor; }
};

}  // namespace kelvasi
