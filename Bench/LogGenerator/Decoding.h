// SPDX-License-Identifier: Apache-2.0
// A generator at work, driven as the model drives it.
#pragma once

#include "Bench/LogGenerator/Samples.h"
#include "Bench/Support/Surroundings.h"
#include "LogGenerator/LogGenerator.h"

namespace kelvasi::bench {

class Decoding {
 public:
  // Throws std::invalid_argument when no generator knows the technology. The display is built.
  explicit Decoding(std::string_view technology);

  void take(std::span<const std::uint8_t> message) { generator_->updateState(*state_, message); }
  void take(const Messages& messages);
  PlistValue tick() { return generator_->generateLogUsingState(*state_); }

 private:
  Surroundings surroundings_;
  std::unique_ptr<LogGenerator> generator_;
  PlistValue::Dictionary state_ = PlistDictionary::make();
};

}  // namespace kelvasi::bench
