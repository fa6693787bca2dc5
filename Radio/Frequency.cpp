// SPDX-License-Identifier: Apache-2.0
#include "Radio/Frequency.h"

#include <cstdlib>

namespace kelvasi {

void appendMegahertz(std::string& text, Frequency frequency) {
  if (frequency.hertz < 0) text += '-';
  const std::int64_t hertz = std::abs(frequency.hertz);
  text += std::to_string(hertz / 1'000'000);
  std::string decimals = std::to_string(1'000'000 + hertz % 1'000'000);  // six of them, after a one
  decimals.erase(decimals.find_last_not_of('0') + 1);
  if (decimals.size() > 1) text.append(".").append(decimals, 1);
}

}  // namespace kelvasi
