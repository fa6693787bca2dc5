// SPDX-License-Identifier: Apache-2.0
// What was measured over time, for each cell and quantity: minimum, maximum, mean and count for each second.
//
// All series share blocks of a fixed number, so memory is bounded however many cells a drive meets; nothing
// is allocated once the store is built. When the blocks for seconds are used up, the oldest of them are put
// together to buckets of 8 s, those in time to buckets of 64 s, and the oldest of these are dropped and
// counted. Minimum, maximum and count survive exactly.
//
// As it stands by default the store takes at most 30.6 MB: 1,080,000 seconds with a value, which is 24 hours
// of 12 series without a gap, then 360,000 buckets of 8 s and 180,000 of 64 s.
#pragma once

#include <array>
#include <chrono>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <vector>

#include "Survey/Series/SeriesKey.h"
#include "Survey/Series/SeriesLevel.h"

namespace kelvasi::survey {

struct SeriesSize {
  std::size_t series = 4096;
  std::array<std::size_t, 3> blocks{36000, 12000, 6000};  // for 1 s, 8 s and 64 s
};

class SeriesStore {
 public:
  explicit SeriesStore(const SeriesSize& size = {});

  // Times may step back, as they do from one capture to the next.
  void add(SeriesKey key, std::chrono::nanoseconds time, float value);

  // Divides [from, to) into as many equal stretches as there are points and says what the values of each come
  // to. A bucket counts where it begins, one that reaches into the first stretch counts there.
  void query(SeriesKey key, std::chrono::nanoseconds from, std::chrono::nanoseconds to,
             std::span<Spread> points) const;
  // All that is kept of a series.
  Spread whole(SeriesKey key) const;

  // Adds all of the other store's series, the key of each as `keyHere(key)` gives it; nothing leaves it out.
  template <typename KeyHere>
  void merge(const SeriesStore& other, KeyHere&& keyHere) {
    std::vector<std::optional<SeriesKey>> keys;
    for (const Slot& slot : other.slots_) keys.push_back(slot.isUsed ? keyHere(slot.key) : std::nullopt);
    mergeBlocks(other, keys);
  }

  template <typename Visit>
  void visitKeys(Visit&& visit) const {
    for (const Entry& entry : index_) visit(entry.key);
  }

  std::size_t size() const { return index_.size(); }
  // Series that made way for others, and values that were dropped with them or for their age.
  std::uint64_t droppedSeries() const { return droppedSeries_; }
  std::uint64_t droppedValues() const { return droppedValues_; }
  std::size_t bytes() const;

 private:
  struct Entry {
    SeriesKey key;
    std::uint32_t slot;
  };
  struct Slot {
    SeriesKey key;
    bool isUsed = false;
    std::uint64_t lastUse = 0;
  };

  std::uint32_t slotFor(SeriesKey key);
  std::uint32_t freeSlot();
  std::optional<std::uint32_t> find(SeriesKey key) const;
  void drop(std::uint32_t slot);
  void addTo(std::size_t level, std::uint32_t slot, std::int64_t bucket, const Spread& spread);
  void makeCoarser(std::size_t level, const SeriesBlock& block);
  void mergeBlocks(const SeriesStore& other, std::span<const std::optional<SeriesKey>> keys);

  std::array<SeriesLevel, 3> levels_;
  std::vector<Entry> index_;  // by key
  std::vector<Slot> slots_;
  std::uint64_t uses_ = 0;
  std::uint64_t droppedSeries_ = 0;
  std::uint64_t droppedValues_ = 0;
};

}  // namespace kelvasi::survey
