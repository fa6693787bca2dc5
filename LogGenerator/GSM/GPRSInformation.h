// SPDX-License-Identifier: Apache-2.0
// Section "GPRS Information": what the GSM serving cell offers for GPRS.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class GPRSInformation : public StateDecoder {
 public:
  explicit GPRSInformation(const Platform& platform);
};

}  // namespace kelvasi
