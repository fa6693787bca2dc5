// SPDX-License-Identifier: Apache-2.0
// What quantities are called and what they mean, in words.
#pragma once

#include <string_view>

#include "Radio/Quantity.h"

namespace kelvasi::cockpit {

struct QuantityWords {
  std::string_view name;     // "RSRP", "transmit power"
  std::string_view meaning;  // one sentence
};

// Of every quantity there is.
QuantityWords wordsOf(const Quantity& quantity);

}  // namespace kelvasi::cockpit
