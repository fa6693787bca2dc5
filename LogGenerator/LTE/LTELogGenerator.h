// SPDX-License-Identifier: Apache-2.0
// The generator of the Orvane LTE baseband.
#pragma once

#include "LogGenerator/OrvaneLogGenerator2.h"

namespace kelvasi {

class LTELogGenerator : public OrvaneLogGenerator2 {
 public:
  static std::unique_ptr<LogGenerator> generator(const Platform& platform);

  explicit LTELogGenerator(const Platform& platform);
  ~LTELogGenerator() override;
};

}  // namespace kelvasi
