// SPDX-License-Identifier: Apache-2.0
#include "Redaction/BitPattern.h"

namespace kelvasi {

namespace {

// The place of a bit that is so many bits from the beginning of its bytes.
unsigned placeIn(std::size_t bit, BitOrder order) {
  const auto within = static_cast<unsigned>(bit % 8);
  return order == BitOrder::mostSignificantFirst ? 7 - within : within;
}

}  // namespace

PlacedPattern placed(std::span<const std::uint8_t> pattern, std::size_t bits, BitOrder order,
                     unsigned shift) {
  const std::size_t size = (shift + bits + 7) / 8;
  PlacedPattern result{Bytes(size), Bytes(size), shift == 0 ? 0u : 1u};
  for (std::size_t bit = 0; bit < bits; ++bit) {
    const unsigned value = pattern[bit / 8] >> placeIn(bit, order) & 1u;
    const std::size_t to = bit + shift;
    const unsigned place = placeIn(to, order);
    result.bytes[to / 8] = static_cast<std::uint8_t>(result.bytes[to / 8] | value << place);
    result.masks[to / 8] = static_cast<std::uint8_t>(result.masks[to / 8] | 1u << place);
  }
  return result;
}

}  // namespace kelvasi
