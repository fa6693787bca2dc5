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
  void show(RecordView record, const EntryList& list, std::span<const Row> rows, std::string_view key,
            PlistDictionary& section);
  void show(const PlistArray& elements, std::string_view key, PlistDictionary& section);

 private:
  PlistArray& emptied(std::string_view key, PlistDictionary& section);

  RowList list_;
  PlistValue::Array shown_;
};

}  // namespace kelvasi
