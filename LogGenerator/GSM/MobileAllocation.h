// Section "Mobile Allocation": the frequencies that the dedicated channel hops over, record 0x51F8.
#pragma once

#include "LogGenerator/ListRow.h"
#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class MobileAllocation : public StateDecoder {
 public:
  explicit MobileAllocation(const Platform& platform);

 protected:
  void decodeOther(RecordView record, LogCode logCode) override;

 private:
  PlistArray frequencies_;
  ListRow shown_;
};

}  // namespace kelvasi
