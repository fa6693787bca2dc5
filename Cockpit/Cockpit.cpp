// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Cockpit.h"

#include <algorithm>
#include <utility>

#include "Cockpit/Cells/CellLooks.h"
#include "Cockpit/Chart/ChartLooks.h"
#include "Cockpit/Events/AlarmBook.h"
#include "Cockpit/Events/Marks.h"
#include "Cockpit/Link/LinkWatch.h"
#include "Cockpit/Rows/RowPath.h"
#include "Cockpit/Serving/ServingLooks.h"
#include "Cockpit/Serving/SideNotes.h"

namespace kelvasi::cockpit {

namespace {

constexpr std::size_t eventsOnTheFace = 3;
constexpr std::size_t marksOnTheFace = 16;

// A row that no cell's series follows.
bool isOfNoCell(const Quantity& quantity, const BookedRow& row) {
  switch (quantity.kind) {
    case QuantityKind::measurement:
      return !row.cell;
    case QuantityKind::state:
    case QuantityKind::count:
    case QuantityKind::parameter:
    case QuantityKind::none:
      return true;
    default:
      return false;
  }
}

}  // namespace

struct Cockpit::Parts {
  explicit Parts(CockpitSetUp chosen)
      : setUp(std::move(chosen)), survey(surveySetUp()), rowSeries(setUp.ofRows) {}

  survey::SurveySetUp surveySetUp() {
    survey::SurveySetUp result;
    result.series = setUp.ofCells;
    result.onEvent = [this](const survey::Event& event) {
      if (setUp.onEvent) setUp.onEvent(eventLineOf(event, eventsSeen, setUp.style));
      ++eventsSeen;
    };
    result.onAlarm = [this](const survey::Alarm& alarm) {
      const AlarmLine line = alarms.take(alarm, setUp.style);
      if (setUp.onAlarm) setUp.onAlarm(line);
    };
    return result;
  }

  View view() const {
    return {survey, rows, rowSeries, notes, setUp.thresholds, setUp.operators, setUp.style};
  }

  void keep(const BookedRow& row, Arrival time) {
    const Quantity* quantity = row.quantity();
    if (!quantity || !isOfNoCell(*quantity, row)) return;
    if (const auto number = row.number())
      rowSeries.add({row.id, quantity}, time, static_cast<float>(*number));
  }

  std::vector<survey::AlarmRule> rules() const {
    std::vector<survey::AlarmRule> result;
    for (std::size_t place = 0; place < survey.alarms().rules(); ++place)
      result.push_back(survey.alarms().rule(place));
    return result;
  }

  CockpitSetUp setUp;
  std::uint64_t eventsSeen = 0;
  AlarmBook alarms;
  survey::Survey survey;
  survey::SeriesStore rowSeries;
  RowBook rows;
  SideNotes notes;
  LinkWatch link;
  CellOrder order;
  Pins pins;
  Marks marks;
};

Cockpit::Cockpit(CockpitSetUp setUp) : parts_(std::make_unique<Parts>(std::move(setUp))) {}

Cockpit::~Cockpit() = default;

void Cockpit::take(const Readings& readings, const Intake& intake) {
  parts_->link.take(readings.arrival(), intake);
  parts_->survey.take(readings, intake);
  parts_->notes.take(readings);
  parts_->rows.take(readings,
                    [&](const std::string&, const BookedRow& row) { parts_->keep(row, readings.arrival()); });
}

void Cockpit::pass(Arrival now) {
  parts_->survey.pass(now);
}

void Cockpit::hear(LinkReport report) {
  parts_->link.hear(std::move(report));
}

Snapshot Cockpit::at(Arrival now) {
  const View view = parts_->view();
  Snapshot snapshot;
  snapshot.time = now;
  snapshot.link = parts_->link.at(now, view.style);
  const ServingCells serving = servingCells(view.survey.cells(), now);
  snapshot.serving = serving.first ? servingCellOf(view, *serving.first, now)
                                   : noServingCell(snapshot.link.lastMessage ? "No serving cell reported yet"
                                                                             : "Nothing received yet");
  if (serving.second) snapshot.second = servingCellOf(view, *serving.second, now);
  snapshot.cells = cellLines(view, serving, parts_->order, parts_->setUp.mostCells, now);
  if (snapshot.cells.empty())
    snapshot.cellsWhy =
        snapshot.link.lastMessage ? "No neighbours reported in the last minute" : "Nothing received yet";
  snapshot.carriers = carrierLines(view, serving, now);
  snapshot.events = events(eventsOnTheFace);
  if (snapshot.events.empty()) snapshot.eventsWhy = "Nothing has happened yet";
  snapshot.eventCount = parts_->eventsSeen;
  snapshot.pins = parts_->pins.at(view.rows, now);
  snapshot.alarms = parts_->alarms.lines(view.survey.alarms());
  snapshot.marks = parts_->marks.newestFirst(marksOnTheFace);
  return snapshot;
}

void Cockpit::hold(bool isHeld) {
  parts_->order.hold(isHeld);
}

std::vector<EventLine> Cockpit::events(std::size_t most, std::size_t skip) const {
  const survey::EventLog& log = parts_->survey.events();
  std::vector<EventLine> lines;
  for (std::size_t back = skip; back < log.size() && lines.size() < most; ++back) {
    const std::size_t place = log.size() - 1 - back;
    lines.push_back(eventLineOf(log.at(place), log.dropped() + place, parts_->setUp.style));
  }
  return lines;
}

std::size_t Cockpit::eventCount() const {
  return parts_->survey.events().size();
}

std::optional<RowSheet> Cockpit::sheet(std::string_view path, Arrival now) const {
  const BookedRow* row = parts_->rows.find(path);
  if (!row) return std::nullopt;
  return sheetOf(std::string(path), *row, now, parts_->setUp.style);
}

SearchResult Cockpit::search(std::string_view text, Arrival now, std::size_t most) const {
  return cockpit::search(parts_->rows, text, now, most);
}

std::optional<std::string> Cockpit::rowPath(std::string_view nodePath) const {
  if (parts_->rows.find(nodePath)) return std::string(nodePath);
  for (const auto& [path, row] : parts_->rows.all()) {
    if (row.isPresent && nodePathOf(path) == nodePath) return path;
  }
  return std::nullopt;
}

bool Cockpit::pin(std::string_view path) {
  return parts_->pins.pin(parts_->rows, path);
}

void Cockpit::unpin(std::string_view key) {
  parts_->pins.unpin(key);
}

std::string Cockpit::pinKey(std::string_view path) const {
  return parts_->pins.keyOf(parts_->rows, path);
}

std::vector<std::string> Cockpit::pinKeys() const {
  return parts_->pins.keys();
}

void Cockpit::restorePins(const std::vector<std::string>& keys) {
  parts_->pins.restore(keys);
}

std::string Cockpit::addAlarm(std::string_view text) {
  auto parsed = survey::parseAlarmRule(text);
  if (const auto* error = std::get_if<survey::AlarmRuleError>(&parsed)) return error->text();
  auto rules = parts_->rules();
  auto& rule = std::get<survey::AlarmRule>(parsed);
  if (std::ranges::find(rules, rule.text, &survey::AlarmRule::text) != rules.end()) return {};
  rules.push_back(std::move(rule));
  parts_->survey.changeRules(std::move(rules));
  return {};
}

void Cockpit::removeAlarm(std::size_t rule) {
  auto rules = parts_->rules();
  if (rule >= rules.size()) return;
  rules.erase(rules.begin() + static_cast<std::ptrdiff_t>(rule));
  parts_->survey.changeRules(std::move(rules));
}

std::vector<std::string> Cockpit::alarmRules() const {
  std::vector<std::string> texts;
  for (const survey::AlarmRule& rule : parts_->rules()) texts.push_back(rule.text);
  return texts;
}

std::uint64_t Cockpit::mark(Arrival time, std::string note) {
  return parts_->marks.set(time, std::move(note), parts_->setUp.style);
}

bool Cockpit::note(std::uint64_t mark, std::string text) {
  return parts_->marks.note(mark, std::move(text));
}

const std::vector<MarkLine>& Cockpit::marks() const {
  return parts_->marks.all();
}

std::optional<ChartLineKey> Cockpit::chartLine(std::string_view path) const {
  return chartLineOf(parts_->view(), path);
}

std::vector<ChartLineKey> Cockpit::chartLines(Arrival now, std::optional<LevelKind> kind,
                                              std::size_t most) const {
  return chartLinesOf(parts_->view(), now, kind, most);
}

ChartPicture Cockpit::draw(const Chart& chart, Arrival now, std::size_t columns) const {
  return pictureOf(parts_->view(), chart, parts_->marks.all(), now, columns);
}

std::string Cockpit::csv(const Chart& chart, Arrival now) const {
  return csvOf(parts_->view(), chart, now);
}

Thresholds& Cockpit::thresholds() {
  return parts_->setUp.thresholds;
}

const survey::Survey& Cockpit::survey() const {
  return parts_->survey;
}

const RowBook& Cockpit::rows() const {
  return parts_->rows;
}

std::size_t Cockpit::bytes() const {
  return parts_->survey.series()->bytes() + parts_->rowSeries.bytes();
}

}  // namespace kelvasi::cockpit
