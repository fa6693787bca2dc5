// SPDX-License-Identifier: Apache-2.0
// A run of buckets of one series, at one resolution. A bucket that saw no value takes no place.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <span>

#include "Survey/Series/Spread.h"

namespace kelvasi::survey {

struct SeriesBlock {
  static constexpr std::size_t capacity = 30;
  static constexpr std::uint32_t none = std::numeric_limits<std::uint32_t>::max();

  // Takes a value of the bucket of this number, counted from 1970 in steps of the resolution. False when
  // there is no room for it.
  bool take(std::int64_t bucket, const Spread& spread);

  std::int64_t bucketAt(std::size_t place) const { return first + offsets[place]; }
  std::int64_t lastBucket() const { return first + offsets[used - 1U]; }

  std::int64_t first = 0;
  std::uint32_t series = none;  // none: the block is free
  std::uint32_t newer = none;   // the series' next block
  std::uint16_t used = 0;
  std::array<std::uint16_t, capacity> offsets{};  // of the buckets from the first, ascending
  std::array<Spread, capacity> spreads{};
};

}  // namespace kelvasi::survey
