// SPDX-License-Identifier: Apache-2.0
// Section "Coding Scheme": asks for no records, so it shows what the template holds.
#pragma once

#include "LogGenerator/RecordlessDecoder.h"

namespace kelvasi {

class CodingScheme : public RecordlessDecoder {
 public:
  explicit CodingScheme(const Platform& platform);
};

}  // namespace kelvasi
