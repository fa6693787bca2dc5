// SPDX-License-Identifier: Apache-2.0
// A row of a dictionary section that holds a list. The list is written in place as long as only the section
// shows it, so that one whose length does not change costs no allocation.
#pragma once

#include <span>
#include <string_view>

#include "LogGenerator/EntryList.h"
#include "LogGenerator/Row.h"
#include "LogGenerator/RowList.h"

namespace kelvasi {

class ListRow {
 public:
  // One dictionary for each entry of the record's list; an empty array when it counts none.
  // `place` is the section's.
  void show(RecordView record, const EntryList& list, std::span<const Row> rows, std::string_view key,
            PlistDictionary& section, const ReadingPlace& place);
  // The row's first field of each entry, without keys.
  void show(RecordView record, const EntryList& list, const Row& row, PlistDictionary& section,
            const ReadingPlace& place);

 private:
  PlistArray& emptied(std::string_view key, PlistDictionary& section, const ReadingPlace& place);

  RowList list_;
  PlistArray elements_;
  PlistValue::Array shown_;
};

}  // namespace kelvasi
