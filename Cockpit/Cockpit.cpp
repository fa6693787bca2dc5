// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Cockpit.h"

#include <utility>

#include "Cockpit/Cells/CellLooks.h"
#include "Cockpit/CockpitParts.h"
#include "Cockpit/Serving/ServingLooks.h"

namespace kelvasi::cockpit {

namespace {

constexpr std::size_t eventsOnTheFace = 3;
constexpr std::size_t marksOnTheFace = 16;

}  // namespace

Cockpit::Cockpit(CockpitSetUp setUp) : parts_(std::make_unique<Parts>(std::move(setUp))) {}

Cockpit::~Cockpit() = default;

void Cockpit::take(const Readings& readings, const Intake& intake) {
  parts_->link.take(readings.arrival(), intake);
  parts_->coverage.take(intake);
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

Thresholds& Cockpit::thresholds() {
  return parts_->setUp.thresholds;
}

const TextStyle& Cockpit::style() const {
  return parts_->setUp.style;
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
