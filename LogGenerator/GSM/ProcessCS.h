// SPDX-License-Identifier: Apache-2.0
// Section "Process CS": mobility management of the circuit-switched domain.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class ProcessCS : public StateDecoder {
 public:
  explicit ProcessCS(const Platform& platform);
};

}  // namespace kelvasi
