// SPDX-License-Identifier: Apache-2.0
// Section "Virtual Active Set": emptied by each cell-sets record, never filled.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class VirtualActiveSet : public ListDecoder {
 public:
  explicit VirtualActiveSet(const Platform& platform);
};

}  // namespace kelvasi
