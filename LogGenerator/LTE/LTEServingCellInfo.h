// SPDX-License-Identifier: Apache-2.0
// Section "Serving Cell Info": identity, frequencies and bandwidths of the serving cell.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class LTEServingCellInfo : public StateDecoder {
 public:
  explicit LTEServingCellInfo(const Platform& platform);

  Outcome updateWithData(RecordView record, LogCode logCode) override;
};

}  // namespace kelvasi
