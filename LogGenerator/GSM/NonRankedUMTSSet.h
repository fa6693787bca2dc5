// SPDX-License-Identifier: Apache-2.0
// Section "Non-Ranked UMTS Set": asks for no records, so it shows what the template holds.
#pragma once

#include "LogGenerator/RecordlessDecoder.h"

namespace kelvasi {

class NonRankedUMTSSet : public RecordlessDecoder {
 public:
  explicit NonRankedUMTSSet(const Platform& platform);
};

}  // namespace kelvasi
