// SPDX-License-Identifier: Apache-2.0
// All series at one resolution: a ring of blocks that they share. Allocates nothing once it is built; memory
// is touched only as it fills.
#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "Survey/Series/SeriesBlock.h"

namespace kelvasi::survey {

class SeriesLevel {
 public:
  SeriesLevel(std::chrono::seconds resolution, std::size_t blocks, std::size_t series)
      : resolution_(resolution), most_(blocks), chains_(series) {
    blocks_.reserve(blocks);
  }

  std::chrono::seconds resolution() const { return resolution_; }
  std::int64_t bucketOf(std::chrono::nanoseconds time) const;
  std::chrono::nanoseconds beginOf(std::int64_t bucket) const { return bucket * resolution_; }

  // Takes a value. When that needs a block and none is free, the oldest is given to `onOldest` and let go.
  template <typename OnOldest>
  void add(std::uint32_t series, std::int64_t bucket, const Spread& spread, OnOldest&& onOldest) {
    if (takenByNewest(series, bucket, spread)) return;
    if (next_ < blocks_.size() && blocks_[next_].series != SeriesBlock::none) {
      onOldest(blocks_[next_]);
      release(blocks_[next_]);
    }
    append(series).take(bucket, spread);
  }

  // The series' blocks, in the order in which they were begun.
  template <typename Visit>
  void visit(std::uint32_t series, Visit&& visit) const {
    for (std::uint32_t at = chains_[series].oldest; at != SeriesBlock::none; at = blocks_[at].newer)
      visit(blocks_[at]);
  }

  // Lets all blocks of a series go.
  void clear(std::uint32_t series);

  // At most.
  std::size_t bytes() const { return most_ * sizeof(SeriesBlock) + chains_.size() * sizeof(Chain); }

 private:
  struct Chain {
    std::uint32_t oldest = SeriesBlock::none;
    std::uint32_t newest = SeriesBlock::none;
  };

  bool takenByNewest(std::uint32_t series, std::int64_t bucket, const Spread& spread);
  // `oldest` is the oldest of its series too, as blocks are begun in the order of the ring.
  void release(SeriesBlock& oldest);
  SeriesBlock& append(std::uint32_t series);

  std::chrono::seconds resolution_;
  std::size_t most_;
  std::vector<SeriesBlock> blocks_;  // up to so many
  std::vector<Chain> chains_;        // by series
  std::size_t next_ = 0;             // the block that is taken next, the one begun longest ago
};

}  // namespace kelvasi::survey
