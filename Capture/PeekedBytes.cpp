// SPDX-License-Identifier: Apache-2.0
#include "Capture/PeekedBytes.h"

#include <algorithm>

namespace kelvasi {

std::span<const std::uint8_t> PeekedBytes::firstBytes(std::size_t count) {
  const std::size_t wanted = std::min(count, first_.size());
  while (firstCount_ < wanted && !endsInFirst_ && !fault_) {
    const auto added = readOn(std::span(first_).first(wanted).subspan(firstCount_));
    if (added == 0) endsInFirst_ = true;
    if (added > 0) firstCount_ += static_cast<std::size_t>(added);
  }
  return std::span(first_).first(std::min(wanted, firstCount_));
}

std::ptrdiff_t PeekedBytes::read(std::span<std::uint8_t> block) {
  if (position_ >= firstCount_) {
    const std::ptrdiff_t count = readOn(block);
    if (count > 0) position_ += static_cast<std::uint64_t>(count);
    return count;
  }
  const auto waiting = std::span(first_).first(firstCount_).subspan(static_cast<std::size_t>(position_));
  const auto taken = waiting.first(std::min(waiting.size(), block.size()));
  std::ranges::copy(taken, block.begin());
  position_ += taken.size();
  return static_cast<std::ptrdiff_t>(taken.size());
}

std::ptrdiff_t PeekedBytes::readOn(std::span<std::uint8_t> block) {
  const std::ptrdiff_t count = bytes_.read(block);
  if (count < 0) fault_ = bytes_.fault();
  return count;
}

}  // namespace kelvasi
