// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Readings.h"

#include <algorithm>

#include "LogGenerator/SortPrefix.h"

namespace kelvasi {

void Readings::begin(Arrival arrival, LogCode logCode) {
  arrival_ = arrival;
  logCode_ = logCode;
  readings_.clear();
  values_.clear();
  texts_.clear();
  sections_.clear();
}

void Readings::identify(std::size_t from, const CellIdentity& cell) {
  for (; from < readings_.size(); ++from) {
    if (readings_[from].kind != Reading::Kind::removal) readings_[from].cell = cell;
  }
}

void Readings::takeChannel(std::size_t from, const CellIdentity& serving) {
  const std::span cells = std::span(readings_).subspan(from);
  const auto isServing = [&](const Reading& reading) {
    return serving.isWhole() && reading.cell.family == serving.family && reading.cell.code == serving.code;
  };
  if (std::ranges::none_of(cells, isServing)) return;
  for (Reading& reading : cells) {
    if (reading.cell.family == serving.family && reading.cell.channel == CellIdentity::unknown)
      reading.cell.channel = serving.channel;
  }
}

void Readings::addRemovals(const ReadingSection& section, std::string_view list, std::size_t entries) {
  for (std::size_t left = entries; left != 0; --left) {
    Reading removal{.kind = Reading::Kind::removal, .section = &section, .list = list};
    (list.empty() ? removal.entry : removal.element) = static_cast<std::int32_t>(left - 1);
    add(removal);
  }
}

void Readings::addValue(const ReadingSection& section, std::string_view row, const PlistValue& value,
                        bool isNew) {
  std::string path;
  appendPathStep(path, row);
  addLeaves({.section = &section}, path, row, values_.emplace_back(value), isNew);
}

void Readings::addEntry(const ReadingSection& section, std::size_t entry, const PlistValue& value) {
  addLeaves({.entry = static_cast<std::int32_t>(entry), .section = &section}, {}, {},
            values_.emplace_back(value), true);
}

void Readings::addDisplay(const PlistValue& display, CellRole (*roleOf)(std::string_view section)) {
  addRemovalOfEverything();
  const PlistDictionary* entries = display.dictionary();
  if (!entries || entries->empty())
    return addLeaves({.section = &sections_.emplace_back()}, {}, {}, values_.emplace_back(display), true);
  for (const auto& [key, value] : *entries) {
    ReadingSection& section = sections_.emplace_back();
    section.name = withoutSortPrefix(key);
    section.role = roleOf(section.name);
    appendPathStep(section.path, key);
    addLeaves({.section = &section}, {}, key, values_.emplace_back(value), true);
  }
}

void Readings::addLeaves(const Reading& place, const std::string& path, std::string_view row,
                         const PlistValue& value, bool isNew) {
  const PlistDictionary* entries = value.dictionary();
  const PlistArray* elements = value.array();
  if (!isNew || !entries || entries->empty()) {
    Reading& reading = readings_.emplace_back(place);
    reading.kind = Reading::Kind::value;
    reading.keyKind = Reading::Key::path;
    reading.list = row;
    reading.key = texts_.emplace_back(path);
    reading.value = &value;
  }
  for (std::size_t at = 0; entries && at < entries->size(); ++at) {
    const auto& [key, entry] = *(entries->begin() + static_cast<std::ptrdiff_t>(at));
    std::string step = path;
    appendPathStep(step, key);
    addLeaves(place, step, key, entry, true);
  }
  for (std::size_t at = 0; elements && at < elements->size(); ++at)
    addLeaves(place, path + "/" + std::to_string(at), row, elements->at(at), true);
}

}  // namespace kelvasi
