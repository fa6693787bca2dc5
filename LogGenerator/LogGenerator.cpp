// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LogGenerator.h"

#include <array>
#include <bit>
#include <utility>

#include "LogGenerator/Exceptions.h"
#include "Platform/Clock.h"
#include "Platform/SystemLog.h"
#include "Plist/Description.h"

namespace kelvasi {

namespace {

constexpr std::size_t historyLimit = 5;

std::string dateText(const void*, std::int64_t seconds) {
  return description(PlistDate{std::bit_cast<double>(seconds)});
}

std::string snapshotText(const void*, std::int64_t seconds) {
  return "Snapshot (" + dateText(nullptr, seconds) + ")";
}

// A shallow copy, written over one that nobody else holds.
void copyOver(PlistValue& copy, const PlistValue& value) {
  if (value.dictionary() && copy.dictionary() && !copy.isShared()) {
    *copy.dictionary() = *value.dictionary();
  } else {
    copy = value.shallowCopy();
  }
}

void writeHistoryEntry(PlistDictionary& entry, const PlistDictionary& state, PlistDate date) {
  const auto seconds = std::bit_cast<std::int64_t>(date.secondsSince1970);
  const std::array values{
      std::pair{"DisplayState", state.get("DisplayState")},
      std::pair{"Display", state.get("Display")},
      std::pair{"ExtraInfo", state.get("ExtraInfo")},
      std::pair{"Date", PlistValue(DeferredText{dateText, nullptr, seconds})},
      std::pair{"Description", PlistValue(DeferredText{snapshotText, nullptr, seconds})},
  };
  std::size_t place = 0;
  for (const auto& [key, value] : values) {
    if (value.isAbsent()) break;
    copyOver(entry.rewrite(key, place), value);
  }
  entry.truncate(place);
}

}  // namespace

LogGenerator::LogGenerator(const Platform& platform) : platform_(platform) {
  platform_.log.print(LogPriority::warning, "Creating Log object: %p", static_cast<void*>(this));
}

void LogGenerator::updateState(PlistDictionary&, std::span<const std::uint8_t>) {
  throw UnimplementedMethodError("LogGenerator::updateState");
}

PlistValue LogGenerator::generateLogUsingState(PlistDictionary&) {
  throw UnimplementedMethodError("LogGenerator::generateLogUsingState");
}

PlistValue LogGenerator::getStartCommand() const {
  throw UnimplementedMethodError("LogGenerator::getStartCommand");
}

PlistValue LogGenerator::getSaveContentsFromState(const PlistDictionary&) const {
  throw UnimplementedMethodError("LogGenerator::getSaveContentsFromState");
}

bool LogGenerator::ownsDisplay(const PlistDictionary&) const {
  return true;
}

void LogGenerator::describe(RowCatalog&) const {}

// The oldest entry becomes the newest one, unless somebody else holds it.
void LogGenerator::updateHistoryInState(PlistDictionary& state, const Clock& clock) {
  if (!state.get("History").array()) state.set("History", PlistArray::make());
  PlistArray& history = *state.get("History").array();
  PlistValue entry;
  if (history.size() >= historyLimit) {
    entry = history.at(0);
    history.removeFirst(history.size() - (historyLimit - 1));
  }
  if (!entry.dictionary() || entry.isShared()) entry = PlistDictionary::make();
  writeHistoryEntry(*entry.dictionary(), state, clock.now());
  history.append(std::move(entry));
}

}  // namespace kelvasi
