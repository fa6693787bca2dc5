// SPDX-License-Identifier: Apache-2.0
// Section "Detected Set": emptied by each cell-sets record, never filled.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class DetectedSet : public ListDecoder {
 public:
  explicit DetectedSet(const Platform& platform);
};

}  // namespace kelvasi
