// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/CockpitParts.h"

#include <utility>

namespace kelvasi::cockpit {

namespace {

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

Cockpit::Parts::Parts(CockpitSetUp chosen)
    : setUp(std::move(chosen)), survey(surveySetUp()), rowSeries(setUp.ofRows) {}

survey::SurveySetUp Cockpit::Parts::surveySetUp() {
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

void Cockpit::Parts::keep(const BookedRow& row, Arrival time) {
  const Quantity* quantity = row.quantity();
  if (!quantity || !isOfNoCell(*quantity, row)) return;
  if (const auto number = row.number()) rowSeries.add({row.id, quantity}, time, static_cast<float>(*number));
}

std::vector<survey::AlarmRule> Cockpit::Parts::rules() const {
  std::vector<survey::AlarmRule> result;
  for (std::size_t place = 0; place < survey.alarms().rules(); ++place)
    result.push_back(survey.alarms().rule(place));
  return result;
}

}  // namespace kelvasi::cockpit
