// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/RowBook.h"

#include <algorithm>
#include <utility>

namespace kelvasi::cockpit {

namespace {

Reading readingOf(const BookedRow& row) {
  Reading reading;
  reading.kind = row.value ? Reading::Kind::value : Reading::Kind::row;
  reading.row = row.row;
  reading.raw = row.raw;
  reading.value = row.value ? &row.value : nullptr;
  return reading;
}

bool isSame(const BookedRow& row, const Reading& reading) {
  if (reading.value) return row.value == *reading.value;
  if (row.row == reading.row) return row.raw == reading.raw;
  // Two kinds of record that write the same row.
  return row.text() == textOf(reading);
}

void forget(BookedRow& row, Arrival time) {
  row.since = time;
  row.changed = time;
  row.writings = 0;
  row.minimum.reset();
  row.maximum.reset();
}

}  // namespace

const Quantity* BookedRow::quantity() const {
  return quantityOf(readingOf(*this));
}

std::optional<double> BookedRow::number() const {
  return numberOf(readingOf(*this));
}

std::string BookedRow::text() const {
  return textOf(readingOf(*this)).value_or("");
}

const BookedRow* RowBook::find(std::string_view path) const {
  const auto found = rows_.find(path);
  return found == rows_.end() ? nullptr : &found->second;
}

const BookedRow* RowBook::find(std::uint32_t id) const {
  const auto found = std::ranges::find_if(rows_, [&](const auto& each) { return each.second.id == id; });
  return found == rows_.end() ? nullptr : &found->second;
}

BookedRow* RowBook::write(const std::string& path, const Reading& reading, Arrival time) {
  auto place = rows_.find(path);
  const bool isNew = place == rows_.end();
  if (isNew) {
    if (rows_.size() == mostRows) {
      ++dropped_;
      return nullptr;
    }
    place = rows_.emplace(path, BookedRow()).first;
    place->second.id = static_cast<std::uint32_t>(rows_.size());
  }
  BookedRow& row = place->second;
  if (isNew || !canBeSame(row.cell, reading.cell)) {
    forget(row, time);
  } else if (!isSame(row, reading)) {
    row.changed = time;
  }
  row.cell = reading.cell;
  row.isPresent = true;
  row.isInList = reading.entry != Reading::notInList || reading.element != Reading::notInList;
  row.row = reading.row;
  row.raw = reading.raw;
  row.value = reading.value ? *reading.value : PlistValue();
  row.last = time;
  ++row.writings;
  if (const auto number = numberOf(reading)) {
    row.minimum = std::min(row.minimum.value_or(*number), *number);
    row.maximum = std::max(row.maximum.value_or(*number), *number);
  }
  return &row;
}

// A path's own row and those below it; "/RSCP 2" stands between "/RSCP" and "/RSCP/0" and is neither.
void RowBook::remove(const std::string& path) {
  if (const auto own = rows_.find(path); own != rows_.end()) own->second.isPresent = false;
  const std::string below = path + '/';
  for (auto row = rows_.lower_bound(below); row != rows_.end() && row->first.starts_with(below); ++row)
    row->second.isPresent = false;
}

}  // namespace kelvasi::cockpit
