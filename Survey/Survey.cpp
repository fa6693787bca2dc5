// SPDX-License-Identifier: Apache-2.0
#include "Survey/Survey.h"

#include <map>
#include <utility>

#include "Survey/Cells/OneOfSeveral.h"

namespace kelvasi::survey {

Survey::Survey(SurveySetUp setUp)
    : onEvent_(std::move(setUp.onEvent)),
      events_(setUp.events),
      alarms_(std::move(setUp.rules), std::move(setUp.onAlarm)),
      finder_([this](const Event& event) { happened(event); }),
      series_(setUp.keepsSeries ? std::make_unique<SeriesStore>(setUp.series) : nullptr),
      cells_(
          [this](const SeenCell* cell, const Reading& reading, double value) {
            measured(cell, reading, value);
          },
          [this](const SeenCell* from, const SeenCell& to, Arrival time) { finder_.serve(from, to, time); }) {
}

void Survey::take(const Readings& readings, const Intake& intake) {
  now_ = readings.arrival();
  finder_.arrive(now_);
  alarms_.pass(now_);
  finder_.take(intake);
  cells_.take(readings);
  if (const SeenCell* serving = cells_.serving(); serving && serving->last == now_)
    finder_.hearServing(serving->identity, now_);
  finder_.take(readings);
}

void Survey::pass(Arrival time) {
  now_ = time;
  finder_.pass(time);
  alarms_.pass(time);
}

void Survey::measured(const SeenCell* cell, const Reading& reading, double value) {
  const Quantity* quantity = quantityOf(reading);
  if (series_) series_->add({cell ? cell->number : 0, quantity}, now_, static_cast<float>(value));
  // Alarms are about the handset where it is: its serving cell, and what is of no cell at all.
  if (cell ? !cells_.isServing(*cell) : isOneOfSeveral(reading)) return;
  const SeenCell* whose = cell ? cell : cells_.serving();
  alarms_.value(*quantity, now_, value, whose ? whose->identity : CellIdentity());
}

void Survey::happened(const Event& event) {
  alarms_.event(event.kind, event.time, event.text(), event.cell);
  events_.add(event);
  if (onEvent_) onEvent_(event);
}

void Survey::merge(const Survey& other) {
  std::map<std::uint32_t, std::uint32_t> numbers{{0, 0}};
  cells_.merge(other.cells_, [&](std::uint32_t there, std::uint32_t here) { numbers[there] = here; });
  if (!series_ || !other.series_) return;
  series_->merge(*other.series_, [&](SeriesKey key) -> std::optional<SeriesKey> {
    const auto number = numbers.find(key.cell);
    if (number == numbers.end()) return std::nullopt;
    return SeriesKey{number->second, key.quantity};
  });
}

}  // namespace kelvasi::survey
