// SPDX-License-Identifier: Apache-2.0
#include "Survey/Series/SeriesBlock.h"

#include <algorithm>

namespace kelvasi::survey {

bool SeriesBlock::take(std::int64_t bucket, const Spread& spread) {
  if (used == 0) first = bucket;
  const std::int64_t offset = bucket - first;
  if (offset < 0 || offset > std::numeric_limits<std::uint16_t>::max()) return false;
  const auto end = offsets.begin() + used;
  const auto found = std::lower_bound(offsets.begin(), end, offset);
  const auto place = static_cast<std::size_t>(found - offsets.begin());
  if (found == end || *found != offset) {
    if (used == capacity) return false;
    std::copy_backward(found, end, end + 1);
    std::copy_backward(spreads.begin() + static_cast<std::ptrdiff_t>(place), spreads.begin() + used,
                       spreads.begin() + used + 1);
    offsets[place] = static_cast<std::uint16_t>(offset);
    spreads[place] = {};
    ++used;
  }
  spreads[place].add(spread);
  return true;
}

}  // namespace kelvasi::survey
