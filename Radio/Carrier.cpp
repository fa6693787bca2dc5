// SPDX-License-Identifier: Apache-2.0
#include "Radio/Carrier.h"

namespace kelvasi {

std::string textOf(const Carriers& carriers) {
  std::string text;
  for (const Carrier& carrier : carriers) {
    if (!text.empty()) text += " or ";
    text.append(carrier.band.name).append(" ");
    appendMegahertz(text, carrier.downlink);
    text += " MHz";
  }
  return text;
}

}  // namespace kelvasi
