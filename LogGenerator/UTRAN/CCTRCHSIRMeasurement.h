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
};

}  // namespace kelvasi
