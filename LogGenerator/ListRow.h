// SPDX-License-Identifier: Apache-2.0
// A row of a dictionary section that holds a list: a column of the section's table. The list is written in
// place as long as only the section shows it, so that one whose length does not change costs no allocation.
#pragma once

#include <span>
#include <string_view>

#include "LogGenerator/EntryList.h"
#include "LogGenerator/Row.h"
#include "LogGenerator/RowList.h"

namespace kelvasi {

struct ListColumn {
  std::string_view key;
  EntryList list;
  std::span<const Row> rows = {};    // of an entry, which is a dictionary
  const Row* element = nullptr;      // instead: an entry is the text of this row
  bool staysWithoutEntries = false;  // a count of 0 leaves the list of before
};

class ListRow {
 public:
  // One element for each entry of the record's list; an empty array when it counts none. `place` is the
  // section's.
  void show(RecordView record, const ListColumn& column, PlistDictionary& section, const ReadingPlace& place);

 private:
  const PlistArray& entriesOf(RecordView record, const ListColumn& column, const ReadingPlace& list);
  const PlistArray& elementsOf(RecordView record, const ListColumn& column, ReadingPlace list);
  PlistArray& emptied(std::string_view key, PlistDictionary& section, const ReadingPlace& place);

  RowList list_;
  PlistArray elements_;
  PlistValue::Array shown_;
};

}  // namespace kelvasi
