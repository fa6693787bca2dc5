// What a record parser is given: the record, the generator state, and where to write.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>
#include <utility>

#include "LogGenerator/C2K/C2KLookup.h"
#include "LogGenerator/C2K/FormattedText.h"
#include "LogGenerator/RecordLayout.h"
#include "LogGenerator/RecordView.h"
#include "Platform/SystemLog.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

struct C2KUpdate {
  RecordView record;
  PlistDictionary& state;
  const PlistDictionary& lookup;
  SystemLog& log;

  void set(std::string_view name, const PlistValue& value) const { setByLookup(name, value, lookup); }
  void set(std::string_view name, const FormattedText& text) const {
    set(name, PlistValue(std::string_view(text)));
  }
  // Into the extra information of the snapshot; nowhere before the display was built.
  void setExtraInfo(std::string_view key, PlistValue value) const {
    const PlistValue extraInfo = state.get("ExtraInfo");
    if (extraInfo.dictionary()) extraInfo.dictionary()->set(key, std::move(value));
  }
  unsigned length() const { return static_cast<unsigned>(record.size()); }
};

// Whether the record has at least this length; else the complaint is logged as an error, made with both
// lengths, an int and a long of either sign.
bool isLongEnough(const C2KUpdate& update, std::size_t minimumLength, const char* complaint)
    __attribute__((format(printf, 3, 0)));

// How one record's field becomes the text of a lookup name.
struct C2KRow {
  std::string_view name;
  std::size_t field = 0;  // its place in the layout
  FormattedText (*text)(std::int64_t value);
};

void show(const C2KUpdate& update, RecordView record, std::span<const Field> layout,
          std::span<const C2KRow> rows);
// "N/A" in place of every row's value.
void showNotAvailable(const C2KUpdate& update, std::span<const C2KRow> rows);

}  // namespace kelvasi
