// SPDX-License-Identifier: Apache-2.0
// What a record parser is given: the record, the generator state, and where to write.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <utility>

#include "LogGenerator/C2K/C2KSections.h"
#include "LogGenerator/C2K/PilotList.h"
#include "LogGenerator/Readings.h"
#include "LogGenerator/RecordLayout.h"
#include "LogGenerator/RecordView.h"
#include "LogGenerator/Row.h"
#include "Platform/SystemLog.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

// The key of a row is its lookup name.
struct C2KUpdate {
  RecordView record;
  PlistDictionary& state;
  const PlistDictionary& lookup;
  SystemLog& log;
  const C2KSections& sections;
  PilotList& pilots;             // for the list of one record
  Readings* readings = nullptr;  // null: nobody listens

  // `row` lasts as long as the process.
  void write(const Row& row, std::int64_t raw, const CellIdentity& cell = {}) const;
  // The pilots in place of a row; each is on the channel of the cell that serves, where it is among them.
  void writePilots(const Row& row) const;
  // Without pilots the row shows what stands in place of a value.
  void writePilotsOrNone(const Row& row) const {
    if (pilots.empty()) return write(row, noValue);
    writePilots(row);
  }
  // Into the extra information of the snapshot; nowhere before the display was built.
  void setExtraInfo(std::string_view key, PlistValue value) const {
    const PlistValue extraInfo = state.get("ExtraInfo");
    if (extraInfo.dictionary()) extraInfo.dictionary()->set(key, std::move(value));
  }
  unsigned length() const { return static_cast<unsigned>(record.size()); }

 private:
  void gather(const Reading& reading, const PlistDictionary& display) const;
};

// Whether the record has at least this length; else the complaint is logged as an error, made with both
// lengths, an int and a long of either sign.
bool isLongEnough(const C2KUpdate& update, std::size_t minimumLength, const char* complaint)
    __attribute__((format(printf, 3, 0)));

void show(const C2KUpdate& update, RecordView record, std::span<const Field> layout,
          std::span<const Row> rows, const CellIdentity& cell = {});
// What each row shows in place of a value that there is not.
void showAbsent(const C2KUpdate& update, std::span<const Row> rows);

}  // namespace kelvasi
