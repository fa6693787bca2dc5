// SPDX-License-Identifier: Apache-2.0
#include "Survey/Series/SeriesStore.h"

#include <algorithm>

namespace kelvasi::survey {

namespace {

using namespace std::chrono_literals;

}  // namespace

SeriesStore::SeriesStore(const SeriesSize& size)
    : levels_{SeriesLevel(1s, size.blocks[0], size.series), SeriesLevel(8s, size.blocks[1], size.series),
              SeriesLevel(64s, size.blocks[2], size.series)},
      slots_(size.series) {
  index_.reserve(size.series);
}

void SeriesStore::add(SeriesKey key, std::chrono::nanoseconds time, float value) {
  addTo(0, slotFor(key), levels_[0].bucketOf(time), Spread::of(value));
}

void SeriesStore::addTo(std::size_t level, std::uint32_t slot, std::int64_t bucket, const Spread& spread) {
  levels_[level].add(slot, bucket, spread, [&](const SeriesBlock& oldest) { makeCoarser(level, oldest); });
}

void SeriesStore::makeCoarser(std::size_t level, const SeriesBlock& block) {
  for (std::size_t place = 0; place < block.used; ++place) {
    const Spread& spread = block.spreads[place];
    if (level + 1 == levels_.size()) {
      droppedValues_ += spread.count;
    } else {
      const auto begin = levels_[level].beginOf(block.bucketAt(place));
      addTo(level + 1, block.series, levels_[level + 1].bucketOf(begin), spread);
    }
  }
}

void SeriesStore::query(SeriesKey key, std::chrono::nanoseconds from, std::chrono::nanoseconds to,
                        std::span<Spread> points) const {
  std::ranges::fill(points, Spread());
  const auto slot = find(key);
  if (!slot || to <= from || points.empty()) return;
  const double perPoint = static_cast<double>((to - from).count()) / static_cast<double>(points.size());
  for (const SeriesLevel& level : levels_) {
    level.visit(*slot, [&](const SeriesBlock& block) {
      if (level.beginOf(block.lastBucket() + 1) <= from || level.beginOf(block.first) >= to) return;
      for (std::size_t place = 0; place < block.used; ++place) {
        const auto begin = level.beginOf(block.bucketAt(place));
        if (begin + level.resolution() <= from || begin >= to) continue;
        const double since = static_cast<double>(std::max(begin - from, 0ns).count());
        const auto point = static_cast<std::size_t>(since / perPoint);
        points[std::min(point, points.size() - 1)].add(block.spreads[place]);
      }
    });
  }
}

Spread SeriesStore::whole(SeriesKey key) const {
  Spread sum;
  const auto slot = find(key);
  if (!slot) return sum;
  for (const SeriesLevel& level : levels_) {
    level.visit(*slot, [&](const SeriesBlock& block) {
      for (std::size_t place = 0; place < block.used; ++place) sum.add(block.spreads[place]);
    });
  }
  return sum;
}

std::optional<std::uint32_t> SeriesStore::find(SeriesKey key) const {
  const auto found = std::ranges::lower_bound(index_, key, {}, &Entry::key);
  if (found == index_.end() || found->key != key) return std::nullopt;
  return found->slot;
}

std::uint32_t SeriesStore::slotFor(SeriesKey key) {
  auto slot = find(key);
  if (!slot) {
    slot = freeSlot();
    slots_[*slot] = {.key = key, .isUsed = true};
    index_.insert(std::ranges::lower_bound(index_, key, {}, &Entry::key), {key, *slot});
  }
  slots_[*slot].lastUse = ++uses_;
  return *slot;
}

std::uint32_t SeriesStore::freeSlot() {
  const auto slot =
      std::ranges::min_element(slots_, {}, [](const Slot& each) { return each.isUsed ? each.lastUse : 0; });
  const auto place = static_cast<std::uint32_t>(slot - slots_.begin());
  if (slot->isUsed) drop(place);
  return place;
}

void SeriesStore::drop(std::uint32_t slot) {
  const SeriesKey key = slots_[slot].key;
  droppedValues_ += whole(key).count;
  ++droppedSeries_;
  for (SeriesLevel& level : levels_) level.clear(slot);
  index_.erase(std::ranges::lower_bound(index_, key, {}, &Entry::key));
  slots_[slot] = {};
}

// By their age over all series, so that what makes way is the oldest here too.
void SeriesStore::mergeBlocks(const SeriesStore& other, std::span<const std::optional<SeriesKey>> keys) {
  struct Block {
    std::chrono::nanoseconds begin;
    std::size_t level;
    SeriesKey key;
    const SeriesBlock* block;
  };
  std::vector<Block> blocks;
  for (std::uint32_t slot = 0; slot < keys.size(); ++slot) {
    if (!keys[slot]) continue;
    for (std::size_t level = 0; level < levels_.size(); ++level) {
      other.levels_[level].visit(slot, [&](const SeriesBlock& block) {
        blocks.push_back({levels_[level].beginOf(block.first), level, *keys[slot], &block});
      });
    }
  }
  std::ranges::stable_sort(blocks, {}, &Block::begin);
  for (const Block& each : blocks) {
    const std::uint32_t slot = slotFor(each.key);
    for (std::size_t place = 0; place < each.block->used; ++place)
      addTo(each.level, slot, each.block->bucketAt(place), each.block->spreads[place]);
  }
  droppedSeries_ += other.droppedSeries_;
  droppedValues_ += other.droppedValues_;
}

std::size_t SeriesStore::bytes() const {
  std::size_t sum = slots_.size() * sizeof(Slot) + index_.capacity() * sizeof(Entry);
  for (const SeriesLevel& level : levels_) sum += level.bytes();
  return sum;
}

}  // namespace kelvasi::survey
