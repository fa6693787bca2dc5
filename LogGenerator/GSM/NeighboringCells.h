// SPDX-License-Identifier: Apache-2.0
// Section "Neighboring Cells": the GSM neighbours, as measured in record 0x5137 or as the cell list has them.
#pragma once

#include <cstdint>
#include <vector>

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class NeighboringCells : public ListDecoder {
 public:
  explicit NeighboringCells(const Platform& platform);

 protected:
  void addEntry(RecordView record, std::size_t place) override;
  CellIdentity cellOf(RecordView record, std::size_t place) const override;
  Outcome decodeOther(RecordView record, LogCode logCode) override;

 private:
  std::optional<std::int64_t> bsicOf(std::int64_t arfcn) const;

  struct CodedCell {
    std::int64_t arfcn;
    std::int64_t bsic;
  };

  // From the last BSIC list; of two entries for one ARFCN the later one counts. Shown by the next 0x5137.
  std::vector<CodedCell> arfcnToBsic_;
};

}  // namespace kelvasi
