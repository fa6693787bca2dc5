// SPDX-License-Identifier: Apache-2.0
// Section "Cell Change Counters": asks for no records, so it shows what the template holds.
#pragma once

#include "LogGenerator/RecordlessDecoder.h"

namespace kelvasi {

class CellChangeCounters : public RecordlessDecoder {
 public:
  explicit CellChangeCounters(const Platform& platform);
};

}  // namespace kelvasi
