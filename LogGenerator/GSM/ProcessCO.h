// SPDX-License-Identifier: Apache-2.0
// Section "Process CO": the service and MM states that both domains have in common.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class ProcessCO : public StateDecoder {
 public:
  explicit ProcessCO(const Platform& platform);
};

}  // namespace kelvasi
