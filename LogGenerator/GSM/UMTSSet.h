// SPDX-License-Identifier: Apache-2.0
// Section "UMTS Set": the UMTS cells ranked for reselection, record 0x4005, or the UMTS neighbours of the
// cell list.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class UMTSSet : public ListDecoder {
 public:
  explicit UMTSSet(const Platform& platform);
};

}  // namespace kelvasi
