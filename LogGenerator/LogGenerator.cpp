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

// The texts of a moment are made when somebody looks, as an entry is seldom looked at.
std::string dateText(const void*, std::int64_t moment) {
  return description(PlistDate{std::bit_cast<double>(moment)});
}

std::string snapshotText(const void*, std::int64_t moment) {
  return "Snapshot (" + dateText(nullptr, moment) + ")";
}

PlistValue historyEntry(const PlistDictionary& state, PlistDate date) {
  const auto moment = std::bit_cast<std::int64_t>(date.secondsSince1970);
  std::array entries{
      std::pair{"DisplayState", state.get("DisplayState").shallowCopy()},
      std::pair{"Display", state.get("Display").shallowCopy()},
      std::pair{"ExtraInfo", state.get("ExtraInfo").shallowCopy()},
      std::pair{"Date", PlistValue(DeferredText{dateText, nullptr, moment})},
      std::pair{"Description", PlistValue(DeferredText{snapshotText, nullptr, moment})},
  };
  const auto entry = PlistDictionary::make();
  entry->reserve(entries.size());
  for (auto& [key, value] : entries) {
    if (value.isAbsent()) break;
    entry->set(key, std::move(value));
  }
  return entry;
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

void LogGenerator::updateHistoryInState(PlistDictionary& state, const Clock& clock) {
  if (!state.get("History").array()) state.set("History", PlistArray::make());
  PlistArray& history = *state.get("History").array();
  if (history.size() >= historyLimit) history.removeFirst(history.size() - (historyLimit - 1));
  history.append(historyEntry(state, clock.now()));
}

}  // namespace kelvasi
