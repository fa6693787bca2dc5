// SPDX-License-Identifier: Apache-2.0
// A list inside a record: a count, then that many entries of one size. Declared once and read by both the
// decoder and the simulated daemon's encoder.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>

#include "LogGenerator/RecordLayout.h"

namespace kelvasi {

struct EntryList {
  Field count;
  unsigned lowBits = 32;      // how many of the count's bits say how many entries there are
  std::size_t uncounted = 0;  // entries beyond those that the count says
  std::size_t start = 0;      // byte of the first entry
  std::size_t stride = 0;     // bytes from one entry to the next
  std::span<const Field> layout;
  // A list behind another one starts this much later for each entry that the other one counts.
  Field countBefore = {};
  std::size_t bytesPerEntryBefore = 0;
};

// The count that the record states, whether or not it has the bytes.
constexpr std::size_t countOf(RecordView record, const EntryList& list) {
  const auto stated = static_cast<std::uint64_t>(valueOf(record, list.count));
  return (stated & ((std::uint64_t{1} << list.lowBits) - 1)) + list.uncounted;
}

// The entry at `place`. Throws ArrayOutOfBoundsException at or past the record's own count, all bits of it.
RecordView entryOf(RecordView record, const EntryList& list, std::size_t place);

}  // namespace kelvasi
