// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/C2KUpdate.h"

#include "LogGenerator/C2K/C2KLookup.h"

namespace kelvasi {

void C2KUpdate::write(const Row& row, std::int64_t raw, const CellIdentity& cell) const {
  forEachLeaf(row.key, lookup, [&](PlistDictionary& display, const std::string& key) {
    display.setText(key, deferredText(row, raw), display.size());
    gather({.row = &row, .raw = raw, .key = key, .cell = cell}, display);
  });
}

void C2KUpdate::writePilots(const Row& row) const {
  forEachLeaf(row.key, lookup, [&](PlistDictionary& display, const std::string& key) {
    const PlistDictionary& shown = pilots.showIn(display, key);
    if (!readings) return;
    const std::size_t before = readings->count();
    pilots.forEachReading(shown, [&](Reading reading) {
      reading.list = key;
      gather(reading, display);
    });
    readings->takeChannel(before, readings->servingCells().certain(pilots.family()));
  });
}

void C2KUpdate::gather(const Reading& reading, const PlistDictionary& display) const {
  const ReadingSection* section = readings ? sections.find(&display) : nullptr;
  if (!section) return;
  Reading whole = reading;
  whole.section = section;
  readings->add(whole);
}

bool isLongEnough(const C2KUpdate& update, std::size_t minimumLength, const char* complaint) {
  if (update.record.size() >= minimumLength) return true;
  update.log.print(LogPriority::error, complaint, update.length(), static_cast<unsigned long>(minimumLength));
  return false;
}

void show(const C2KUpdate& update, RecordView record, std::span<const Field> layout,
          std::span<const Row> rows, const CellIdentity& cell) {
  for (const Row& row : rows) update.write(row, rawOf(record, layout, row), cell);
}

void showAbsent(const C2KUpdate& update, std::span<const Row> rows) {
  for (const Row& row : rows) update.write(row, noValue);
}

}  // namespace kelvasi
