// SPDX-License-Identifier: Apache-2.0
// Section "Process PS": mobility management of the packet-switched domain.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class ProcessPS : public StateDecoder {
 public:
  explicit ProcessPS(const Platform& platform);
};

}  // namespace kelvasi
