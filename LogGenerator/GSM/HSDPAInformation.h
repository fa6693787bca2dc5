// SPDX-License-Identifier: Apache-2.0
// Section "HSDPA Info": statistics of the HARQ processes, record 0x4221.
#pragma once

#include "LogGenerator/ListRow.h"
#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class HSDPAInformation : public StateDecoder {
 public:
  explicit HSDPAInformation(const Platform& platform);

 protected:
  Outcome decodeOther(RecordView record, LogCode logCode) override;

 private:
  ListRow primary_;
  ListRow secondary_;
};

}  // namespace kelvasi
