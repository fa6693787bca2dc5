// SPDX-License-Identifier: Apache-2.0
// Section "Monitored Set": emptied by each cell-sets record, never filled.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class MonitoredSet : public ListDecoder {
 public:
  explicit MonitoredSet(const Platform& platform);
};

}  // namespace kelvasi
