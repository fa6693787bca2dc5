// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/C2KRecords.h"

#include <array>

#include "LogGenerator/C2K/DeviceStatus.h"
#include "LogGenerator/C2K/EvdoActiveSet.h"
#include "LogGenerator/C2K/EvdoRates.h"
#include "LogGenerator/C2K/EvdoStatus.h"
#include "LogGenerator/C2K/Fingers.h"
#include "LogGenerator/C2K/SystemParameters.h"
#include "LogGenerator/C2K/TrafficFER.h"

namespace kelvasi {

// A new record adds its header above and its line here.
std::span<const C2KRecord> c2kRecords() {
  static constexpr std::array records{
      fingers::record,           // 0x108A
      evdoStatus::record,        // 0x1183
      evdoForwardRate::record,   // 0x1192
      evdoActiveSet::record,     // 0x12B6
      deviceStatus::record,      // 0x119C
      trafficFER::record,        // 0x119D
      evdoReverseRate::record,   // 0x127E
      systemParameters::record,  // 0x134F
  };
  return records;
}

}  // namespace kelvasi
