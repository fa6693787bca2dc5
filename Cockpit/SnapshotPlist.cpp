// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Serving/CellWords.h"
#include "Cockpit/Snapshot.h"

namespace kelvasi::cockpit {

namespace {

using Entries = PlistValue::Dictionary;

double inSeconds(std::chrono::nanoseconds time) {
  return std::chrono::duration<double>(time).count();
}

template <typename List, typename Make>
PlistValue arrayOf(const List& list, Make&& make) {
  const auto array = PlistArray::make();
  for (const auto& each : list) array->append(make(each));
  return array;
}

PlistValue plistOf(const Age& age) {
  return PlistDictionary::make(
      {{"seconds", inSeconds(age.time)}, {"text", age.text}, {"fade", std::string(nameOf(age.fade))}});
}

PlistValue plistOf(const NamedValue& named) {
  return PlistDictionary::make({{"name", named.name}, {"value", named.value}});
}

PlistValue plistOf(const Link& link) {
  const auto entries = PlistDictionary::make({{"state", nameOf(link.state)},
                                              {"words", link.words},
                                              {"shortly", link.shortly},
                                              {"sentence", link.sentence},
                                              {"technology", link.technology},
                                              {"messages", link.messages},
                                              {"not_shown", link.notShown},
                                              {"counters", link.counters}});
  if (link.age) entries->set("age", inSeconds(*link.age));
  return entries;
}

std::size_t seen(const Line& line) {
  std::size_t points = 0;
  for (const survey::Spread& point : line.points) points += point.count > 0 ? 1 : 0;
  return points;
}

PlistValue plistOf(const Level& level) {
  const auto entries = PlistDictionary::make({{"name", std::string(level.name)},
                                              {"id", std::string(definitionOf(level.kind).id)},
                                              {"unit", std::string(level.unit)},
                                              {"text", level.text},
                                              {"verdict", std::string(level.verdictWord)},
                                              {"trend", std::string(wordOf(level.trend))},
                                              {"age", plistOf(level.age)},
                                              {"seconds_with_values", seen(level.line)}});
  if (level.value) entries->set("value", *level.value);
  return entries;
}

PlistValue plistOf(const ServingCell& serving) {
  if (!serving.isKnown) return PlistDictionary::make({{"title", serving.title}, {"why", serving.why}});
  return PlistDictionary::make(
      {{"title", serving.title},
       {"subtitle", serving.subtitle},
       {"cell", textOf(serving.identity)},
       {"technology", serving.technology},
       {"network", serving.network},
       {"bands", serving.bands},
       {"frequency", serving.frequency},
       {"channel", plistOf(serving.channel)},
       {"code", plistOf(serving.code)},
       {"area", arrayOf(serving.area, [](const NamedValue& each) { return plistOf(each); })},
       {"ids", arrayOf(serving.ids, [](const NamedValue& each) { return plistOf(each); })},
       {"levels", arrayOf(serving.levels, [](const Level& each) { return plistOf(each); })},
       {"age", plistOf(serving.age)}});
}

PlistValue plistOf(const CellLine& line) {
  return PlistDictionary::make({{"cell", textOf(line.identity)},
                                {"name", line.name},
                                {"technology", line.technology},
                                {"channel", line.channel},
                                {"bands", line.bands},
                                {"role", std::string(nameOf(line.role))},
                                {"level", plistOf(line.level)},
                                {"difference", line.differenceText},
                                {"age", plistOf(line.age)}});
}

PlistValue plistOf(const CarrierLine& line) {
  return PlistDictionary::make({{"technology", line.technology},
                                {"channel", line.channelText},
                                {"bands", line.bands},
                                {"frequency", line.frequency},
                                {"cells", line.cells},
                                {"serving", line.isServing},
                                {"best", line.bestName},
                                {"level", line.best.text}});
}

PlistValue plistOf(const EventLine& line) {
  return PlistDictionary::make({{"number", line.number},
                                {"time", inSeconds(line.time)},
                                {"clock", line.timeText},
                                {"event", std::string(nameOf(line.kind))},
                                {"words", line.words},
                                {"cell", textOf(line.cell)}});
}

PlistValue plistOf(const PinLine& line) {
  return PlistDictionary::make({{"key", line.key},
                                {"path", line.path},
                                {"name", line.name},
                                {"place", line.place},
                                {"cell", line.cellText},
                                {"present", line.isPresent},
                                {"value", line.value},
                                {"age", plistOf(line.age)}});
}

PlistValue plistOf(const AlarmLine& line) {
  return PlistDictionary::make({{"rule", line.ruleText},
                                {"raised", line.isRaised},
                                {"given", line.given},
                                {"words", line.words},
                                {"clock", line.timeText}});
}

PlistValue plistOf(const MarkLine& line) {
  return PlistDictionary::make({{"number", line.number},
                                {"time", inSeconds(line.time)},
                                {"clock", line.timeText},
                                {"note", line.note}});
}

}  // namespace

PlistValue plistOf(const Snapshot& snapshot) {
  const auto entries = PlistDictionary::make({{"time", inSeconds(snapshot.time)},
                                              {"link", plistOf(snapshot.link)},
                                              {"serving", plistOf(snapshot.serving)}});
  if (snapshot.second) entries->set("second", plistOf(*snapshot.second));
  const auto add = [&](const char* key, const auto& list) {
    entries->set(key, arrayOf(list, [](const auto& each) { return plistOf(each); }));
  };
  add("cells", snapshot.cells);
  entries->set("cells_why", snapshot.cellsWhy);
  add("carriers", snapshot.carriers);
  add("events", snapshot.events);
  entries->set("events_why", snapshot.eventsWhy);
  entries->set("event_count", snapshot.eventCount);
  add("pins", snapshot.pins);
  add("alarms", snapshot.alarms);
  add("marks", snapshot.marks);
  return entries;
}

}  // namespace kelvasi::cockpit
