// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ObjectStream/ObjectReadings.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace kelvasi {

namespace {

constexpr Scale wire{.curve = fromRaw};

constexpr Row number(std::string_view key, const Quantity& quantity) {
  return {.key = key, .quantity = quantity, .scale = wire};
}
constexpr Row level(std::string_view key, const Quantity& quantity, std::string_view unit) {
  return {.key = key, .quantity = quantity, .unit = unit, .scale = wire};
}

// To add a name, add its line.
constexpr std::array rows{
    number("ARFCN", quantity::arfcn),
    number("BSIC", quantity::bsic),
    number("UARFCN", quantity::uarfcn),
    number("Scrambling Code", quantity::scramblingCode),
    number("E-ARFCN", quantity::earfcn),
    number("Physical Cell ID", quantity::pci),
    number("Cell ID", quantity::cellId),
    number("Location Area Code", quantity::lac),
    number("Routing Area Code", quantity::rac),
    number("Tracking Area Code", quantity::tac),
    number("MCC", quantity::mcc),
    number("MNC", quantity::mnc),
    level("Received Level", quantity::rssi, " dBm"),
    level("RSSI", quantity::rssi, " dBm"),
    level("RSCP", quantity::rscp, " dBm"),
    level("Ec/No", quantity::ecno, " dB"),
    level("RSRP", quantity::rsrp, " dBm"),
    level("RSRQ", quantity::rsrq, " dB"),
    level("Transmit Power", quantity::txPower, " dBm"),
};

struct SectionRole {
  std::string_view name;
  CellRole role;
};
constexpr std::array sectionRoles{
    SectionRole{"Serving Cell", CellRole::serving},
    SectionRole{"Neighbor Cells", CellRole::neighbour},
};

struct CellNames {
  RadioFamily family;
  const Quantity* channel;
  const Quantity* code;
};
constexpr std::array cellNames{
    CellNames{RadioFamily::gsm, &quantity::arfcn, &quantity::bsic},
    CellNames{RadioFamily::umts, &quantity::uarfcn, &quantity::scramblingCode},
    CellNames{RadioFamily::lte, &quantity::earfcn, &quantity::pci},
};

// The number of a text that is a number and the unit, and nothing else.
std::optional<double> numberIn(std::string_view text, std::string_view unit) {
  if (!text.ends_with(unit)) return std::nullopt;
  text.remove_suffix(unit.size());
  if (text.starts_with('+')) text.remove_prefix(1);
  double number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  const bool isWhole = error == std::errc() && end == text.data() + text.size();
  return isWhole && std::isfinite(number) ? std::optional(number) : std::nullopt;
}

void nameReading(Reading& reading) {
  const std::string* const text = reading.value ? reading.value->string() : nullptr;
  const auto row = text ? std::ranges::find(rows, reading.list, &Row::key) : rows.end();
  const auto found = row == rows.end() ? std::nullopt : numberIn(*text, row->unit);
  if (!found) return;
  reading.row = row;
  reading.raw = rawOf(*found);
}

// Values of one group differ in the last step of their paths.
struct Group {
  const ReadingSection* section;
  std::string_view path;
  CellIdentity cell = {};
  bool operator==(const Group& other) const { return section == other.section && path == other.path; }
};

Group groupOf(const Reading& reading) {
  return {reading.section, reading.key.substr(0, reading.key.rfind('/'))};
}

// What the row says of its group's cell.
void learn(CellIdentity& cell, const Reading& reading) {
  const Quantity* const quantity = quantityOf(reading);
  const auto value = static_cast<std::int64_t>(numberOf(reading).value_or(CellIdentity::unknown));
  for (const CellNames& names : cellNames) {
    if (quantity != names.channel && quantity != names.code) continue;
    if (cell.family != names.family) cell = {.family = names.family};
    (quantity == names.channel ? cell.channel : cell.code) = value;
  }
}

}  // namespace

std::span<const Row> objectRows() {
  return rows;
}

CellRole roleOfObjectSection(std::string_view name) {
  const auto found = std::ranges::find(sectionRoles, name, &SectionRole::name);
  return found == sectionRoles.end() ? CellRole::none : found->role;
}

void nameObjectReadings(std::span<Reading> readings) {
  std::vector<Group> groups;
  for (Reading& reading : readings) {
    nameReading(reading);
    if (!reading.row) continue;
    Group group = groupOf(reading);
    const auto known = std::ranges::find(groups, group);
    learn(known == groups.end() ? group.cell : known->cell, reading);
    if (known == groups.end()) groups.push_back(group);
  }
  for (Reading& reading : readings) {
    const auto group = reading.value ? std::ranges::find(groups, groupOf(reading)) : groups.end();
    if (group != groups.end()) reading.cell = group->cell;
  }
}

}  // namespace kelvasi
