// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/C2KLogGenerator.h"

#include <algorithm>

#include "LogGenerator/C2K/C2KLookup.h"
#include "LogGenerator/C2K/C2KRecords.h"
#include "LogGenerator/C2K/C2KUpdate.h"
#include "LogGenerator/C2K/PilotList.h"
#include "LogGenerator/RecordFraming.h"
#include "LogGenerator/RowCatalog.h"
#include "LogGenerator/SortPrefix.h"
#include "Platform/PlistSerialiser.h"
#include "Platform/Resources.h"

namespace kelvasi {

namespace {

PlistValue loadTemplate(const Platform& platform) {
  const auto bytes = platform.resources.contents("C2KTemplate", "plist");
  const auto parsed = bytes ? platform.plists.parse(*bytes) : std::nullopt;
  return parsed && parsed->dictionary() ? *parsed : PlistValue();
}

void addLeaf(const std::string& name, const std::string& key, const PlistValue& display,
             PlistDictionary& lookup) {
  display.dictionary()->set(key, "");
  if (!lookup.find(name)) lookup.set(name, PlistArray::make());
  lookup.find(name)->array()->append(PlistDictionary::make({{"key", key}, {"dict", display}}));
}

}  // namespace

std::unique_ptr<LogGenerator> C2KLogGenerator::generator(const Platform& platform) {
  return std::make_unique<C2KLogGenerator>(platform);
}

void C2KLogGenerator::updateState(PlistDictionary& state, std::span<const std::uint8_t> data) {
  const PlistValue display = getDisplayFromState(state, platform());
  if (!display.dictionary() || display.dictionary() != seen_.dictionary()) {
    isOwn_ = ownsDisplay(state);
    seen_ = display;
  }
  if (readings() && isOwn_) sections_.learn(display);
  const PlistValue lookup = isOwn_ ? state.get("Lookup") : PlistValue();
  if (lookup.dictionary()) return updateFromLog(data, *lookup.dictionary(), state);
  updateFromLog(data, PlistDictionary(), state);
}

bool C2KLogGenerator::ownsDisplay(const PlistDictionary& state) const {
  const PlistValue* display = state.find("Display");
  const PlistValue* lookup = state.find("Lookup");
  if (!display) return true;
  return lookup && lookup->dictionary() && leadsInto(*display, *lookup->dictionary());
}

void C2KLogGenerator::updateFromLog(std::span<const std::uint8_t> data, const PlistDictionary& lookup,
                                    PlistDictionary& state) {
  const auto framed = frameRecord(data);
  if (readings()) readings()->begin(arrival(), framed ? framed->logCode : 0);
  if (!framed) return count(0, Outcome::notARecord, data);
  // Despite its wording the line does not stop the record.
  const bool isKnownType = framed->logType == 1;
  if (!isKnownType) {
    platform().log.print(LogPriority::error, "Invalid log type: %x. Dropping.", unsigned{framed->logType});
  }
  const auto records = c2kRecords();
  const auto record = std::ranges::find(records, framed->logCode, &C2KRecord::logCode);
  if (record == records.end())
    return count(framed->logCode, isKnownType ? Outcome::notAskedFor : Outcome::unknownLogType,
                 framed->record.bytes());
  const Outcome outcome =
      record->parse({framed->record, state, lookup, platform().log, sections_, pilots_, readings()});
  count(framed->logCode, outcome, framed->record.bytes(), record->versionAt);
  appendRawMessage(framed->record.bytes());
}

void C2KLogGenerator::describe(RowCatalog& catalog) const {
  PlistDictionary state;
  C2KSections sections;
  getDisplayFromState(state, platform());
  sections.learn(getDisplayFromState(state, platform()));
  const PlistValue lookup = state.get("Lookup");
  if (!lookup.dictionary()) return;
  for (const C2KRecord& record : c2kRecords()) {
    RowCatalog byName;
    for (RecordPart part : record.parts()) {
      part.minimumLength = record.minimumLength;
      byName.add({}, part);
      catalog.addPart(part);
    }
    for (const CatalogRow& row : byName.rows()) {
      forEachLeaf(row.row->key, *lookup.dictionary(),
                  [&](const PlistDictionary& display, const std::string& key) {
                    CatalogRow& added = catalog.rows().emplace_back(row);
                    added.section = sections.find(&display)->name;
                    added.key = key;
                    if (added.list.empty()) return;
                    added.list = key;
                    catalog.add({.section = added.section,
                                 .key = std::string(sortedRow.key),
                                 .logCode = added.logCode,
                                 .row = &sortedRow,
                                 .list = key});
                  });
    }
  }
}

PlistValue C2KLogGenerator::generateLogUsingState(PlistDictionary& state) {
  const PlistValue display = getDisplayFromState(state, platform());
  moveRawMessagesInto(state);
  updateHistoryInState(state, platform().clock);
  return display;
}

PlistValue C2KLogGenerator::getStartCommand() const {
  const auto logCodes = PlistArray::make();
  for (const C2KRecord& record : c2kRecords()) logCodes->append(record.logCode);
  return PlistDictionary::make({{"SetState", "Streaming"}, {"SetOrvaneLogCodes", logCodes}});
}

PlistValue C2KLogGenerator::getDisplayFromState(PlistDictionary& state, const Platform& platform) {
  if (const PlistValue* display = state.find("Display")) return *display;
  if (!state.find("Template")) {
    const PlistValue loaded = loadTemplate(platform);
    if (loaded.isAbsent()) {
      platform.log.print(LogPriority::error, "Cannot load C2K template for display");
      return {};
    }
    state.set("Template", loaded);
  }
  const PlistValue display = PlistDictionary::make();
  const PlistValue lookup = PlistDictionary::make();
  const PlistValue displayTemplate = state.get("Template");
  if (displayTemplate.dictionary()) {
    processTemplate(*displayTemplate.dictionary(), display, *lookup.dictionary(), platform.log);
  }
  state.set("Display", display);
  state.set("Lookup", lookup);
  state.set("ExtraInfo", PlistDictionary::make());
  return display;
}

void C2KLogGenerator::processTemplate(const PlistDictionary& displayTemplate, const PlistValue& display,
                                      PlistDictionary& lookup, SystemLog& log) {
  for (const auto& [key, value] : displayTemplate) {
    if (const PlistDictionary* section = value.dictionary()) {
      const PlistValue nested = PlistDictionary::make();
      processTemplate(*section, nested, lookup, log);
      display.dictionary()->set(key, nested);
    } else if (const std::string* name = value.string()) {
      if (*name == sortedMark) {
        display.dictionary()->set(key, *name);
      } else {
        addLeaf(*name, key, display, lookup);
      }
    }
  }
  log.print(LogPriority::warning, "Processing the template");
}

}  // namespace kelvasi
