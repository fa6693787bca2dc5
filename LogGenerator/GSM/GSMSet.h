// SPDX-License-Identifier: Apache-2.0
// Section "GSM Set": the GSM cells ranked for reselection, record 0x4005.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class GSMSet : public ListDecoder {
 public:
  explicit GSMSet(const Platform& platform);
};

}  // namespace kelvasi
