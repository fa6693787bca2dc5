// SPDX-License-Identifier: Apache-2.0
// Section "Equivalent PLMN List" (3GPP TS 24.008, 10.5.1.13), record 0x7150.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class EquivalentPLMNList : public ListDecoder {
 public:
  explicit EquivalentPLMNList(const Platform& platform);

 protected:
  void addEntry(RecordView record, std::size_t place) override;
};

}  // namespace kelvasi
