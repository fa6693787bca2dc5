// SPDX-License-Identifier: Apache-2.0
// Section "UMTS RR Info": RRC state, transmit power and serving cell in UMTS.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class UMTSRRInfo : public StateDecoder {
 public:
  explicit UMTSRRInfo(const Platform& platform);

 protected:
  Outcome decodeOther(RecordView record, LogCode logCode) override;

 private:
  Outcome showTransmitPower(RecordView record) const;
  Outcome showServingCell(RecordView record) const;
};

}  // namespace kelvasi
