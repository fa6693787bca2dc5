// SPDX-License-Identifier: Apache-2.0
// Section "Active Set" (3GPP TS 25.331, 8.4): the WCDMA cells of the active set, record 0x417A.
#pragma once

#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

class ActiveSet : public ListDecoder {
 public:
  explicit ActiveSet(const Platform& platform);

 protected:
  void addEntry(RecordView record, std::size_t place) override;
};

}  // namespace kelvasi
