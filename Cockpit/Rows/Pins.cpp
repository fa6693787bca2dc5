// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/Pins.h"

#include <algorithm>

#include "Cockpit/Levels/Level.h"
#include "Cockpit/Rows/RowPath.h"
#include "Cockpit/Serving/CellWords.h"

namespace kelvasi::cockpit {

namespace {

// Between a cell and the shape of the path in a pin's key: "lte:3350/404 /Neighbor Cells List/*/RSRP".
constexpr char separator = ' ';

// In a list the place says nothing, the cell does.
std::string keyOf(const std::string& path, const BookedRow& row) {
  if (!row.isInList || !row.cell) return path;
  return textOf(row.cell) + separator + shapeOf(path);
}

}  // namespace

std::optional<Pins::Pin> Pins::read(const std::string& key) {
  Pin pin;
  pin.key = key;
  if (key.starts_with('/')) {
    pin.lastPath = key;
    return pin;
  }
  const auto end = key.find(separator);
  if (end == std::string::npos || !cellFromText(key.substr(0, end)) || key.compare(end + 1, 1, "/") != 0)
    return std::nullopt;
  pin.cell = key.substr(0, end);
  pin.shape = key.substr(end + 1);
  pin.lastPath = pin.shape;
  return pin;
}

bool Pins::pin(const RowBook& book, std::string_view path) {
  const BookedRow* row = book.find(path);
  if (!row) return false;
  const std::string key = cockpit::keyOf(std::string(path), *row);
  if (std::ranges::find(pins_, key, &Pin::key) != pins_.end()) return true;
  auto pin = read(key);
  if (!pin || pins_.size() == mostPins) return false;
  pin->lastPath = path;
  pins_.push_back(std::move(*pin));
  return true;
}

void Pins::unpin(std::string_view key) {
  std::erase_if(pins_, [&](const Pin& pin) { return pin.key == key; });
}

std::string Pins::keyOf(const RowBook& book, std::string_view path) const {
  const BookedRow* row = book.find(path);
  if (!row) return {};
  const std::string key = cockpit::keyOf(std::string(path), *row);
  return std::ranges::find(pins_, key, &Pin::key) == pins_.end() ? std::string() : key;
}

std::vector<std::string> Pins::keys() const {
  std::vector<std::string> keys;
  for (const Pin& pin : pins_) keys.push_back(pin.key);
  return keys;
}

void Pins::restore(const std::vector<std::string>& keys) {
  pins_.clear();
  for (const std::string& key : keys) {
    auto pin = read(key);
    const bool isNew = std::ranges::find(pins_, key, &Pin::key) == pins_.end();
    if (pin && isNew && pins_.size() < mostPins) pins_.push_back(std::move(*pin));
  }
}

// The row where it stood last, else wherever the cell stands now; a row that names a part of the cell only is
// the cell's when no other can be.
const std::string* Pins::placeOf(const RowBook& book, const Pin& pin) const {
  const auto last = book.all().find(pin.lastPath);
  const bool stands = last != book.all().end() && last->second.isPresent;
  if (pin.cell.empty()) return stands ? &last->first : nullptr;
  const auto cell = cellFromText(pin.cell).value_or(CellIdentity());
  if (stands && last->second.cell == cell && shapeOf(last->first) == pin.shape) return &last->first;
  // All paths of a shape begin alike.
  const std::string begin = pin.shape.substr(0, pin.shape.find('*'));
  std::vector<const std::string*> places;
  for (auto row = book.all().lower_bound(begin); row != book.all().end() && row->first.starts_with(begin);
       ++row) {
    if (!row->second.isPresent || !canBeSame(row->second.cell, cell) || shapeOf(row->first) != pin.shape)
      continue;
    if (row->second.cell == cell) return &row->first;
    places.push_back(&row->first);
  }
  return places.size() == 1 ? places.front() : nullptr;
}

std::vector<PinLine> Pins::at(const RowBook& book, Arrival now) {
  std::vector<PinLine> lines;
  for (Pin& pin : pins_) {
    PinLine line;
    if (const std::string* path = placeOf(book, pin)) {
      const BookedRow& row = *book.find(*path);
      pin.lastPath = *path;
      pin.lastValue = row.text();
      pin.last = row.last;
      line.isPresent = true;
    }
    line.key = pin.key;
    line.path = pin.lastPath;
    line.nodePath = nodePathOf(pin.lastPath);
    line.name = rowNameOf(pin.lastPath);
    line.place = placeTextOf(pin.lastPath);
    if (const auto cell = cellFromText(pin.cell)) line.cellText = fullCellName(*cell);
    if (const BookedRow* row = line.isPresent ? book.find(line.path) : nullptr)
      line.cellText = fullCellName(row->cell);
    line.value = pin.last ? pin.lastValue : std::string(notReported);
    if (pin.last) line.age = ageOf(*pin.last, now, !line.isPresent);
    lines.push_back(std::move(line));
  }
  return lines;
}

}  // namespace kelvasi::cockpit
