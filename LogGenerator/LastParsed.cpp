// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LastParsed.h"

#include <algorithm>

namespace kelvasi {

std::optional<PlistValue> LastParsed::parse(std::span<const std::uint8_t> bytes) const {
  if (!hasParsed_ || !std::ranges::equal(bytes, bytes_)) {
    parsed_ = serialiser_.parse(bytes);
    bytes_.assign(bytes.begin(), bytes.end());
    hasParsed_ = true;
  }
  return parsed_;
}

}  // namespace kelvasi
