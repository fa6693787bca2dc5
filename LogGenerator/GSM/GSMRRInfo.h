// SPDX-License-Identifier: Apache-2.0
// Section "GSM RR Info": state and reception of GSM radio resource management.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class GSMRRInfo : public StateDecoder {
 public:
  explicit GSMRRInfo(const Platform& platform);
};

}  // namespace kelvasi
