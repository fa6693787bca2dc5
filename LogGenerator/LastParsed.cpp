// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LastParsed.h"

#include <algorithm>

namespace kelvasi {

std::optional<PlistValue> LastParsed::parse(std::span<const std::uint8_t> bytes) const {
  if (!hasParsed_ || !std::ranges::equal(bytes, bytes_)) {
    serialiser_.parseOver(parsed_, bytes);
    bytes_.assign(bytes.begin(), bytes.end());
    hasParsed_ = true;
  }
  if (parsed_.isAbsent()) return std::nullopt;
  return parsed_;
}

}  // namespace kelvasi
