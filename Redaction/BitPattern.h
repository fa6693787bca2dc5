// SPDX-License-Identifier: Apache-2.0
// Bits that may stand at any bit of a byte, the most or the least significant one first.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

#include "Plist/PlistValue.h"

namespace kelvasi {

enum class BitOrder { mostSignificantFirst, leastSignificantFirst };

// A pattern at one of the eight places that it can have in its first byte.
struct PlacedPattern {
  Bytes bytes;
  Bytes masks;             // the bits of each byte that are the pattern's
  std::size_t window = 0;  // where three bytes begin that are wholly the pattern's
};

inline constexpr std::size_t windowBytes = 3;
// Fewer bits are somewhere by chance, and may have no window.
inline constexpr std::size_t fewestBits = 36;

// The first `bits` of `pattern`, shifted by so many bits, 0 to 7.
PlacedPattern placed(std::span<const std::uint8_t> pattern, std::size_t bits, BitOrder order, unsigned shift);

}  // namespace kelvasi
