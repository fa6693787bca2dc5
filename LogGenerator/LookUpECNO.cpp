// SPDX-License-Identifier: Apache-2.0
#include <algorithm>

#include "LogGenerator/Base.h"
#include "LogGenerator/EcnoLadder.h"

namespace kelvasi {

std::int16_t Base::lookUpECNO(std::uint32_t linear) {
  const auto step =
      std::ranges::find_if(ecnoLadder, [&](const EcnoStep& candidate) { return linear >= candidate.from; });
  return step == ecnoLadder.end() ? std::int16_t{0} : step->decibels;
}

}  // namespace kelvasi
