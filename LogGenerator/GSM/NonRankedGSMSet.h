// SPDX-License-Identifier: Apache-2.0
// Section "Non-Ranked GSM Set": asks for no records, so it shows what the template holds.
#pragma once

#include "LogGenerator/RecordlessDecoder.h"

namespace kelvasi {

class NonRankedGSMSet : public RecordlessDecoder {
 public:
  explicit NonRankedGSMSet(const Platform& platform);
};

}  // namespace kelvasi
