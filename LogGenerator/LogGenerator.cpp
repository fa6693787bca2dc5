// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LogGenerator.h"

#include <array>
#include <utility>

#include "LogGenerator/Exceptions.h"
#include "Platform/Clock.h"
#include "Platform/SystemLog.h"
#include "Plist/Description.h"

namespace kelvasi {

namespace {

constexpr std::size_t historyLimit = 5;

PlistValue historyEntry(const PlistDictionary& state, const std::string& date) {
  const std::array entries{
      std::pair{"DisplayState", state.get("DisplayState").shallowCopy()},
      std::pair{"Display", state.get("Display").shallowCopy()},
      std::pair{"ExtraInfo", state.get("ExtraInfo").shallowCopy()},
      std::pair{"Date", PlistValue(date)},
      std::pair{"Description", PlistValue("Snapshot (" + date + ")")},
  };
  const auto entry = PlistDictionary::make();
  for (const auto& [key, value] : entries) {
    if (value.isAbsent()) break;
    entry->set(key, value);
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
  history.append(historyEntry(state, description(clock.now())));
}

}  // namespace kelvasi
