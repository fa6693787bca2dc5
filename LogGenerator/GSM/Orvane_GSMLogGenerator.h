// SPDX-License-Identifier: Apache-2.0
// The generator of the Orvane GSM/UMTS baseband.
#pragma once

#include "LogGenerator/OrvaneLogGenerator2.h"

namespace kelvasi {

class Orvane_GSMLogGenerator : public OrvaneLogGenerator2 {
 public:
  static std::unique_ptr<LogGenerator> generator(const Platform& platform);

  explicit Orvane_GSMLogGenerator(const Platform& platform);
  ~Orvane_GSMLogGenerator() override;
};

}  // namespace kelvasi
