// SPDX-License-Identifier: Apache-2.0
// Section "Reselection Candidates": the cell from which reselection looks for candidates.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class ReselectionCandidatesMisc : public StateDecoder {
 public:
  explicit ReselectionCandidatesMisc(const Platform& platform);
};

}  // namespace kelvasi
