// SPDX-License-Identifier: Apache-2.0
#include "Bench/LogGenerator/Decoding.h"

#include <stdexcept>
#include <string>

namespace kelvasi::bench {

Decoding::Decoding(std::string_view technology)
    : generator_(LogGenerator::generatorFromTechnology(technology, surroundings_.platform())) {
  if (!generator_) throw std::invalid_argument("no generator for " + std::string(technology));
  tick();
}

void Decoding::take(const Messages& messages) {
  for (const Bytes& message : messages) take(message);
}

}  // namespace kelvasi::bench
