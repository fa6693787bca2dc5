// SPDX-License-Identifier: Apache-2.0
// What is asked of a cockpit beside its face: coverage, rows, pins, alarms, marks, charts.
#include <algorithm>
#include <utility>

#include "Cockpit/Chart/ChartLooks.h"
#include "Cockpit/CockpitParts.h"
#include "Cockpit/Rows/RowPath.h"

namespace kelvasi::cockpit {

Coverage Cockpit::coverage(Arrival now) const {
  return parts_->coverage.at(now);
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

}  // namespace kelvasi::cockpit
