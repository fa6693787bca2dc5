// SPDX-License-Identifier: Apache-2.0
#include "Survey/Series/SeriesLevel.h"

namespace kelvasi::survey {

std::int64_t SeriesLevel::bucketOf(std::chrono::nanoseconds time) const {
  return std::chrono::floor<std::chrono::seconds>(time).count() / resolution_.count();
}

bool SeriesLevel::takenByNewest(std::uint32_t series, std::int64_t bucket, const Spread& spread) {
  const std::uint32_t newest = chains_[series].newest;
  return newest != SeriesBlock::none && blocks_[newest].take(bucket, spread);
}

void SeriesLevel::release(SeriesBlock& oldest) {
  Chain& chain = chains_[oldest.series];
  chain.oldest = oldest.newer;
  if (chain.oldest == SeriesBlock::none) chain.newest = SeriesBlock::none;
  oldest = SeriesBlock();
}

SeriesBlock& SeriesLevel::append(std::uint32_t series) {
  const auto place = static_cast<std::uint32_t>(next_);
  if (next_ == blocks_.size()) blocks_.emplace_back();
  next_ = (next_ + 1) % most_;
  Chain& chain = chains_[series];
  if (chain.newest == SeriesBlock::none) {
    chain.oldest = place;
  } else {
    blocks_[chain.newest].newer = place;
  }
  chain.newest = place;
  blocks_[place].series = series;
  return blocks_[place];
}

void SeriesLevel::clear(std::uint32_t series) {
  std::uint32_t at = chains_[series].oldest;
  chains_[series] = Chain();
  while (at != SeriesBlock::none) {
    const std::uint32_t newer = blocks_[at].newer;
    blocks_[at] = SeriesBlock();
    at = newer;
  }
}

}  // namespace kelvasi::survey
