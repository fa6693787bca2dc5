// SPDX-License-Identifier: Apache-2.0
// Section "Neighbor Cells List": the neighbour cells as measured in idle mode.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class NeighborCellsList : public ListDecoder {
 public:
  explicit NeighborCellsList(const Platform& platform);

 protected:
  void addEntry(RecordView record, std::size_t place) override;

 private:
  void traceEntry(RecordView record, std::size_t place) const;
};

}  // namespace kelvasi
