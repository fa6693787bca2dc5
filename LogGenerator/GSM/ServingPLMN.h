// SPDX-License-Identifier: Apache-2.0
// Section "Serving PLMN": the network that the handset is registered in.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class ServingPLMN : public StateDecoder {
 public:
  explicit ServingPLMN(const Platform& platform);

 protected:
  Outcome decodeOther(RecordView record, LogCode logCode) override;
};

}  // namespace kelvasi
