// SPDX-License-Identifier: Apache-2.0
// Section "Reselection Candidates List": the candidates for reselection, each with the rows of its
// technology.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class ReselectionCandidatesList : public ListDecoder {
 public:
  explicit ReselectionCandidatesList(const Platform& platform);

 protected:
  void addEntry(RecordView record, std::size_t place) override;
  CellIdentity cellOf(RecordView record, std::size_t place) const override;
};

}  // namespace kelvasi
