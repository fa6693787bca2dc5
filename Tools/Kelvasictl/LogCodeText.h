// SPDX-License-Identifier: Apache-2.0
// A log code as people and scripts write it.
#pragma once

#include <array>
#include <cstdio>
#include <string>

#include "LogGenerator/LogCode.h"

namespace kelvasi {

// "0xB17F", "0xFF0001".
inline std::string logCodeText(LogCode code) {
  std::array<char, 16> text;
  const int length = std::snprintf(text.data(), text.size(), "0x%04X", static_cast<unsigned>(code));
  return {text.data(), static_cast<std::size_t>(length)};
}

}  // namespace kelvasi
