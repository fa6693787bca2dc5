// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Events/AlarmBook.h"

#include "Cockpit/Rows/QuantityWords.h"
#include "Cockpit/Serving/CellWords.h"
#include "Cockpit/Words/Age.h"

namespace kelvasi::cockpit {

std::string wordsOf(const survey::Alarm& alarm, const TextStyle& style) {
  if (alarm.rule.kind == survey::AlarmRule::Kind::event) return std::string(alarm.event);
  const Quantity& quantity = *alarm.rule.quantity;
  std::string text(wordsOf(quantity).name);
  if (alarm.value) {
    text += " " + shortNumberText(*alarm.value, 2, style);
    if (!quantity.unit.empty()) text += " " + std::string(quantity.unit);
  } else {
    text = "no " + text + " for " + durationText(alarm.time - alarm.since);
  }
  return alarm.cell ? text + ", " + fullCellName(alarm.cell) : text;
}

AlarmLine AlarmBook::take(const survey::Alarm& alarm, const TextStyle& style) {
  AlarmLine& line = last_[alarm.rule.text];
  line.ruleText = alarm.rule.text;
  line.isRaised = alarm.rule.kind != survey::AlarmRule::Kind::event;
  ++line.given;
  line.words = wordsOf(alarm, style);
  line.time = alarm.time;
  line.timeText = clockText(alarm.time, style);
  return line;
}

std::vector<AlarmLine> AlarmBook::lines(const survey::AlarmWatch& watch) const {
  std::vector<AlarmLine> lines;
  for (std::size_t place = 0; place < watch.rules(); ++place) {
    const auto last = last_.find(watch.rule(place).text);
    AlarmLine line = last == last_.end() ? AlarmLine() : last->second;
    line.rule = place;
    line.ruleText = watch.rule(place).text;
    line.isRaised = watch.isRaised(place);
    lines.push_back(std::move(line));
  }
  return lines;
}

}  // namespace kelvasi::cockpit
