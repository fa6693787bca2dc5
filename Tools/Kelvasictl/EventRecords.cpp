// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/EventRecords.h"

#include <array>

#include "Tools/Kelvasictl/RecordText.h"

namespace kelvasi {

namespace {

constexpr std::array columnsOfEvents{
    Column{.key = "time", .width = 19, .isTime = true},
    Column{.key = "technology"},
    Column{.key = "event", .width = 14},
    Column{.key = "cell", .width = 16},
    Column{.key = "quantity"},
    Column{.key = "from"},
    Column{.key = "to"},
    Column{.key = "reason"},
    Column{.key = "text", .width = 1},
};

constexpr std::array columnsOfAlarms{
    Column{.key = "time", .width = 19, .isTime = true},
    Column{.key = "technology"},
    Column{.key = "rule"},
    Column{.key = "since", .width = 19, .isTime = true},
    Column{.key = "cell"},
    Column{.key = "quantity"},
    Column{.key = "value"},
    Column{.key = "unit"},
    Column{.key = "event"},
    Column{.key = "held_back", .width = 9, .isNumber = true},
    Column{.key = "text", .width = 1},
};

Json textOrNull(std::string_view text) {
  return text.empty() ? Json() : Json(text);
}

std::string inDigits(double value) {
  std::string text = Json(value).dump();
  if (text.ends_with(".0")) text.resize(text.size() - 2);
  return text;
}

// What there is to say beside the rule.
std::string findingOf(const survey::Alarm& alarm) {
  if (!alarm.event.empty()) return std::string(alarm.event);
  if (!alarm.value) return "no value since " + rfc3339(alarm.since);
  const std::string_view unit = alarm.rule.quantity->unit;
  return inDigits(*alarm.value) + (unit.empty() ? "" : " " + std::string(unit));
}

}  // namespace

std::span<const Column> eventColumns() {
  return columnsOfEvents;
}

Json eventRecord(const survey::Event& event, std::string_view technology) {
  Json record;
  record["time"] = rfc3339(event.time);
  record["technology"] = technology;
  record["event"] = nameOf(event.kind);
  record["cell"] = textOrNull(textOf(event.cell));
  record["quantity"] = event.quantity ? Json(event.quantity->id) : Json();
  record["from"] = textOrNull(event.from);
  record["to"] = textOrNull(event.to);
  record["reason"] = textOrNull(event.reason);
  record["text"] = event.text();
  return record;
}

std::span<const Column> alarmColumns() {
  return columnsOfAlarms;
}

Json alarmRecord(const survey::Alarm& alarm, std::string_view technology) {
  const Quantity* quantity = alarm.rule.quantity;
  Json record;
  record["time"] = rfc3339(alarm.time);
  record["technology"] = technology;
  record["rule"] = alarm.rule.text;
  record["since"] = rfc3339(alarm.since);
  record["cell"] = textOrNull(textOf(alarm.cell));
  record["quantity"] = quantity ? Json(quantity->id) : Json();
  record["value"] = alarm.value ? Json(*alarm.value) : Json();
  record["unit"] = quantity ? textOrNull(quantity->unit) : Json();
  record["event"] = quantity ? Json() : Json(nameOf(alarm.rule.event));
  record["held_back"] = alarm.heldBack;
  record["text"] = alarmText(alarm);
  return record;
}

std::string alarmText(const survey::Alarm& alarm) {
  const std::string cell = textOf(alarm.cell);
  const std::string finding = findingOf(alarm);
  const bool saysCell = cell.empty() || finding.ends_with(cell);
  return alarm.rule.text + ": " + finding + (saysCell ? "" : ", " + cell);
}

}  // namespace kelvasi
