// SPDX-License-Identifier: Apache-2.0
// Section "GSM Serving Cell": identity, channel and measurements of the GSM serving cell.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class GSMServingCell : public StateDecoder {
 public:
  explicit GSMServingCell(const Platform& platform);
};

}  // namespace kelvasi
