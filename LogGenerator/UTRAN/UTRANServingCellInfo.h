// SPDX-License-Identifier: Apache-2.0
// Section "Serving Cell Info": the serving cell.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class UTRANServingCellInfo : public StateDecoder {
 public:
  explicit UTRANServingCellInfo(const Platform& platform);

  void describe(RowCatalog& catalog) const override;

 protected:
  Outcome decodeOther(RecordView record, LogCode logCode) override;
};

}  // namespace kelvasi
