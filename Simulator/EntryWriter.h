// SPDX-License-Identifier: Apache-2.0
// Writes a record's list from the same declaration that its decoder reads.
#pragma once

#include "LogGenerator/EntryList.h"
#include "LogGenerator/RecordWriter.h"

namespace kelvasi::sim {

// Sets the list's count and appends its entries. `encode` sets the fields of one item in a writer of its
// entry. The record ends before the list begins; a list behind another one is written after that. A list
// whose count leaves entries out has at least these.
template <typename Items, typename Encode>
void writeEntries(RecordWriter& record, const EntryList& list, const Items& items, Encode encode) {
  record.set(list.count.name, static_cast<std::int64_t>(items.size() - list.uncounted));
  const auto before = static_cast<std::size_t>(valueOf(RecordView(record.bytes()), list.countBefore));
  record.padTo(list.start + before * list.bytesPerEntryBefore);
  for (const auto& item : items) {
    RecordWriter entry(list.layout, list.stride);
    encode(item, entry);
    record.append(entry.bytes());
  }
}

}  // namespace kelvasi::sim
