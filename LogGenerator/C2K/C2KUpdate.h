// What a record parser is given: the record, the generator state, and where to write.
#pragma once

#include <string_view>

#include "LogGenerator/C2K/C2KLookup.h"
#include "LogGenerator/C2K/C2KText.h"
#include "LogGenerator/RecordLayout.h"
#include "Platform/SystemLog.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

struct C2KUpdate {
  RecordView record;
  PlistDictionary& state;
  const PlistDictionary& lookup;
  SystemLog& log;

  void set(std::string_view name, const PlistValue& value) const { setByLookup(name, value, lookup); }
  void set(std::string_view name, const C2KText& text) const {
    set(name, PlistValue(std::string_view(text)));
  }
  // Into the extra information of the snapshot; nowhere before the display was built.
  void setExtraInfo(std::string_view key, PlistValue value) const {
    const PlistValue extraInfo = state.get("ExtraInfo");
    if (extraInfo.dictionary()) extraInfo.dictionary()->set(key, std::move(value));
  }
  unsigned length() const { return static_cast<unsigned>(record.size()); }
};

// How one record's field becomes the text of a lookup name.
struct C2KRow {
  std::string_view name;
  std::size_t field = 0;  // its place in the layout
  C2KText (*text)(std::int64_t value);
};

inline void show(const C2KUpdate& update, RecordView record, std::span<const Field> layout,
                 std::span<const C2KRow> rows) {
  for (const C2KRow& row : rows) update.set(row.name, row.text(valueOf(record, layout[row.field])));
}

}  // namespace kelvasi
