// SPDX-License-Identifier: Apache-2.0
// Section "BLER": what the block error rate of each transport channel is made of, record 0x4116.
#pragma once

#include "LogGenerator/ListRow.h"
#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class BLER : public StateDecoder {
 public:
  explicit BLER(const Platform& platform);

 protected:
  Outcome decodeOther(RecordView record, LogCode logCode) override;

 private:
  ListRow channels_;
};

}  // namespace kelvasi
