// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/DriveReport.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <iterator>

#include "Report/Moments.h"
#include "Tools/Kelvasictl/CellRecords.h"

namespace kelvasi {

namespace {

using survey::Event;
using survey::EventKind;
using survey::SeenCell;
using survey::Spread;

constexpr std::size_t mostLines = 8;
constexpr std::size_t mostPoints = 900;
constexpr std::size_t mostRows = 2000;

struct Level {
  const Quantity* quantity;
  const char* name;
};
constexpr std::array levels{
    Level{&quantity::rsrp, "RSRP"},
    Level{&quantity::rsrq, "RSRQ"},
    Level{&quantity::rscp, "RSCP"},
    Level{&quantity::ecno, "Ec/No"},
    Level{&quantity::rxlev, "RxLev"},
    Level{&quantity::rssi, "RSSI"},
    Level{&quantity::ecio, "Ec/Io"},
    Level{&quantity::carrierToInterference, "C/I"},
    Level{&quantity::rxPower, "Received power"},
};

double inSeconds(Arrival time) {
  return std::chrono::duration<double>(time).count();
}

const char* nameOf(const Quantity& quantity) {
  return std::ranges::find(levels, &quantity, &Level::quantity)->name;
}

std::string moreThanShown(std::size_t all, std::size_t shown, const std::string& what) {
  return all > shown ? std::to_string(all - shown) + " more " + what + " are not shown." : "";
}

// Of a record's member, for people.
std::string words(const Json& value) {
  if (value.is_null()) return {};
  if (value.is_string()) return value.get<std::string>();
  if (!value.is_array()) return value.dump();
  std::string text;
  for (const Json& each : value) text += (text.empty() ? "" : " ") + words(each);
  return text;
}

// From "2024-03-05T14:07:09.250000Z".
std::string moment(const Json& value) {
  std::string text = words(value).substr(0, 19);
  std::ranges::replace(text, 'T', ' ');
  return text;
}

std::string levelWords(const Json& record) {
  for (const Level& level : levels) {
    const auto found = record["levels"].find(std::string(level.quantity->id));
    if (found == record["levels"].end()) continue;
    const auto in = [&](const char* key) {
      return Json(std::round((*found)[key].get<double>() * 10) / 10).dump();
    };
    return std::string(level.name) + " " + in("min") + " / " + in("mean") + " / " + in("max") + " " +
           words((*found)["unit"]);
  }
  return {};
}

}  // namespace

SurveyUse DriveReport::use() {
  SurveyUse result;
  result.setUp = [this](const std::string&, const SurveyUse::Print&) {
    survey::SurveySetUp setUp;
    setUp.events = 0;
    setUp.onEvent = [this](const Event& event) {
      if (event.kind != EventKind::stateChange) events_.push_back(event);
    };
    return setUp;
  };
  result.take = [this](const Surveyed& surveyed) { take(surveyed); };
  return result;
}

void DriveReport::take(const Surveyed& surveyed) {
  whole_.merge(surveyed.survey);
  std::ranges::stable_sort(events_, {}, &Event::time);
  const Intake& intake = surveyed.generator.intake();
  coverage_.add(surveyed.technology, intake, logCodesAsked(surveyed.generator));
  messages_ += intake.messages();
  shown_ += intake.messages(Outcome::shown);
  for (const IntakeCount& count : intake.counts()) {
    first_ = std::min(first_, count.first);
    last_ = std::max(last_, count.last);
  }
  if (std::ranges::find(technologies_, surveyed.technology) == technologies_.end())
    technologies_.push_back(surveyed.technology);
}

report::Report DriveReport::report(const std::vector<std::string>& captures,
                                   const Operators& operators) const {
  report::Report page;
  page.title =
      "Drive of " + (messages_ == 0 ? "no messages" : report::dateAndTime(inSeconds(first_)) + " UTC");
  addSummary(page, captures);
  addLevels(page);
  page.tables.push_back(cellTable(operators));
  const auto fromTo = [](const Event& event) {
    return std::vector{report::dateAndTime(inSeconds(event.time)), event.from, event.to};
  };
  page.tables.push_back(eventTable(EventKind::cellChange,
                                   {.title = "Cell changes", .headings = {"Time", "From", "To"}, .rows = {}},
                                   fromTo));
  page.tables.push_back(
      eventTable(EventKind::ratChange,
                 {.title = "Changes of technology", .headings = {"Time", "From", "To"}, .rows = {}}, fromTo));
  page.tables.push_back(eventTable(
      EventKind::reject, {.title = "Rejects", .headings = {"Time", "Who", "Cause", "Cell"}, .rows = {}},
      [](const Event& event) {
        return std::vector{report::dateAndTime(inSeconds(event.time)),
                           std::string(event.quantity ? event.quantity->id : ""), event.to,
                           textOf(event.cell)};
      }));
  page.tables.push_back(gapTable(EventKind::serviceLost, EventKind::serviceBack,
                                 {.title = "Without service", .headings = {}, .rows = {}}));
  page.tables.push_back(gapTable(EventKind::linkLost, EventKind::linkBack,
                                 {.title = "Without messages", .headings = {}, .rows = {}}));
  page.tables.push_back(coverageTable());
  return page;
}

void DriveReport::addSummary(report::Report& page, const std::vector<std::string>& captures) const {
  std::string files;
  for (const std::string& capture : captures)
    files += (files.empty() ? "" : ", ") + capture.substr(capture.rfind('/') + 1);
  std::string technologies;
  for (const std::string& each : technologies_) technologies += (technologies.empty() ? "" : ", ") + each;
  const auto count = [&](EventKind kind) {
    return std::to_string(std::ranges::count(events_, kind, &Event::kind));
  };
  page.summary = {{"Captures", files}, {"Technology", technologies}, {"Messages", std::to_string(messages_)}};
  if (messages_ == 0) return;
  const double share = 100.0 * static_cast<double>(shown_) / static_cast<double>(messages_);
  page.summary.insert(page.summary.end(), {{"Shown", Json(std::round(share * 10) / 10).dump() + " %"},
                                           {"From", report::dateAndTime(inSeconds(first_)) + " UTC"},
                                           {"To", report::dateAndTime(inSeconds(last_)) + " UTC"},
                                           {"Duration", report::duration(inSeconds(last_ - first_))},
                                           {"Cells", std::to_string(whole_.cells().all().size())},
                                           {"Cell changes", count(EventKind::cellChange)},
                                           {"Rejects", count(EventKind::reject)},
                                           {"Losses of service", count(EventKind::serviceLost)}});
}

void DriveReport::addLevels(report::Report& page) const {
  if (last_ <= first_) return;
  for (const Level& level : levels) {
    report::Chart chart = chartOf(*level.quantity);
    if (chart.lines.empty()) continue;
    page.charts.push_back(std::move(chart));
    report::Histogram histogram = histogramOf(*level.quantity);
    if (!histogram.bins.empty()) page.histograms.push_back(std::move(histogram));
  }
}

report::Chart DriveReport::chartOf(const Quantity& quantity) const {
  std::vector<const SeenCell*> cells;
  for (const SeenCell& cell : whole_.cells().all()) {
    if (cell.level(quantity)) cells.push_back(&cell);
  }
  std::ranges::stable_sort(cells, std::greater(),
                           [&](const SeenCell* cell) { return cell->level(quantity)->count; });
  const double from = std::floor(inSeconds(first_));
  const double to = std::floor(inSeconds(last_)) + 1;
  const auto count = static_cast<std::size_t>(std::min<double>(mostPoints, to - from));
  report::Chart chart{.title = nameOf(quantity),
                      .unit = std::string(quantity.unit),
                      .from = from,
                      .to = to,
                      .step = (to - from) / static_cast<double>(count),
                      .lines = {}};
  chart.note = moreThanShown(cells.size(), mostLines, "cells");
  cells.resize(std::min(cells.size(), mostLines));
  std::vector<Spread> points(count);
  for (const SeenCell* cell : cells) {
    std::ranges::fill(points, Spread());
    whole_.series()->query({cell->number, &quantity}, std::chrono::seconds(static_cast<std::int64_t>(from)),
                           std::chrono::seconds(static_cast<std::int64_t>(to)), points);
    report::Line line{textOf(cell->identity), {}};
    for (std::size_t at = 0; at < points.size(); ++at) {
      if (points[at].count == 0) continue;
      line.points.push_back({from + chart.step * static_cast<double>(at), points[at].minimum, points[at].mean,
                             points[at].maximum});
    }
    if (!line.points.empty()) chart.lines.push_back(std::move(line));
  }
  return chart;
}

// Whether it was the serving cell, as far as changes of it say; before the first, what that came from.
bool DriveReport::serves(const SeenCell& cell, double time) const {
  const auto isChange = [](const Event& event) { return event.kind == EventKind::cellChange; };
  const auto after =
      std::ranges::upper_bound(events_, time, {}, [](const Event& event) { return inSeconds(event.time); });
  const auto last = std::find_if(std::reverse_iterator(after), events_.rend(), isChange);
  if (last != events_.rend()) return last->cell == cell.identity;
  const auto next = std::find_if(after, events_.end(), isChange);
  return next == events_.end() || next->from == textOf(cell.identity);
}

// Of seconds: the mean of each in which the cell served.
report::Histogram DriveReport::histogramOf(const Quantity& quantity) const {
  constexpr std::size_t most = 86400;
  const auto from = std::chrono::floor<std::chrono::seconds>(first_);
  const auto to = std::chrono::floor<std::chrono::seconds>(last_) + std::chrono::seconds(1);
  const auto seconds = static_cast<std::size_t>((to - from).count());
  std::vector<Spread> points(std::min(seconds, most));
  const double step = static_cast<double>(seconds) / static_cast<double>(points.size());
  std::vector<double> values;
  for (const SeenCell& cell : whole_.cells().all()) {
    if (!cell.roles.has(CellRole::serving) || !cell.level(quantity)) continue;
    std::ranges::fill(points, Spread());
    whole_.series()->query({cell.number, &quantity}, from, to, points);
    for (std::size_t at = 0; at < points.size(); ++at) {
      const double time = inSeconds(from) + step * static_cast<double>(at + 1);
      if (points[at].count != 0 && serves(cell, time)) values.push_back(points[at].mean);
    }
  }
  if (values.empty()) return {};
  const auto ends = std::ranges::minmax(values);
  const double least = ends.min;
  const double greatest = ends.max;
  constexpr std::array widths{0.5, 1.0, 2.0, 5.0};
  constexpr double mostBins = 60;
  const auto fits =
      std::ranges::find_if(widths, [&](double each) { return (greatest - least) / each < mostBins; });
  const double width = fits == widths.end() ? (greatest - least) / mostBins : *fits;
  report::Histogram histogram{.title = std::string(nameOf(quantity)) + " of the serving cell",
                              .unit = std::string(quantity.unit),
                              .first = std::floor(least / width) * width,
                              .width = width,
                              .bins = {}};
  histogram.bins.resize(static_cast<std::size_t>((greatest - histogram.first) / width) + 1);
  for (const double value : values)
    ++histogram.bins[static_cast<std::size_t>((value - histogram.first) / width)];
  return histogram;
}

report::Table DriveReport::cellTable(const Operators& operators) const {
  report::Table table{.title = "Cells",
                      .headings = {"Cell", "Band", "MHz", "Network", "Area", "Cell identity", "Roles",
                                   "First", "Last", "Messages", "Least / mean / most"},
                      .rows = {}};
  const std::vector<Json> records = cellRecords(whole_.cells(), operators);
  for (const Json& record : records) {
    if (table.rows.size() == mostRows) break;
    std::vector<std::string> row;
    for (const char* key : {"cell", "bands", "mhz", "network", "area", "cell_id", "roles"})
      row.push_back(words(record[key]));
    row.insert(row.end(), {moment(record["first"]), moment(record["last"]), words(record["messages"]),
                           levelWords(record)});
    table.rows.push_back(std::move(row));
  }
  table.note = records.empty() ? "None." : moreThanShown(records.size(), table.rows.size(), "cells");
  return table;
}

report::Table DriveReport::eventTable(EventKind kind, report::Table table, Pick pick) const {
  std::size_t all = 0;
  for (const Event& event : events_) {
    if (event.kind != kind) continue;
    if (all++ < mostRows) table.rows.push_back(pick(event));
  }
  table.note = all == 0 ? "None." : moreThanShown(all, mostRows, "of them");
  return table;
}

// What is not back at the end has no end.
report::Table DriveReport::gapTable(EventKind begin, EventKind end, report::Table table) const {
  table.headings = {"From", "To", "Duration", "Why", "Back"};
  const Event* lost = nullptr;
  std::size_t all = 0;
  const auto add = [&](const Event* back) {
    if (lost && all++ < mostRows)
      table.rows.push_back({report::dateAndTime(inSeconds(lost->time)),
                            back ? report::dateAndTime(inSeconds(back->time)) : "",
                            back ? report::duration(inSeconds(back->time - lost->time)) : "", lost->to,
                            back ? back->to : "not until the end"});
    lost = nullptr;
  };
  for (const Event& event : events_) {
    if (event.kind == begin && !lost) lost = &event;
    if (event.kind == end) add(&event);
  }
  add(nullptr);
  table.note = all == 0 ? "None." : moreThanShown(all, mostRows, "of them");
  return table;
}

report::Table DriveReport::coverageTable() const {
  report::Table table{.title = "Coverage of decoding",
                      .headings = {"Technology", "Log code", "What became of it", "Messages", "Share"},
                      .rows = {}};
  for (const Json& record : coverage_.records()) {
    if (table.rows.size() == mostRows) break;
    const double share = 100 * static_cast<double>(record.value("messages", std::uint64_t{0})) /
                         static_cast<double>(std::max<std::uint64_t>(messages_, 1));
    table.rows.push_back({words(record["technology"]), words(record["code"]), words(record["outcome"]),
                          words(record["messages"]), Json(std::round(share * 100) / 100).dump() + " %"});
  }
  if (table.rows.empty()) table.note = "None.";
  return table;
}

}  // namespace kelvasi
