// SPDX-License-Identifier: Apache-2.0
// Section "Mobile Allocation": the frequencies that the dedicated channel hops over, record 0x51F8.
#pragma once

#include "LogGenerator/ListRow.h"
#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class MobileAllocation : public StateDecoder {
 public:
  explicit MobileAllocation(const Platform& platform);

 protected:
  Outcome decodeOther(RecordView record, LogCode logCode) override;

 private:
  ListRow frequencies_;
};

}  // namespace kelvasi
