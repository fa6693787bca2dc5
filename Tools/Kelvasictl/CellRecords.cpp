// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/CellRecords.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <iterator>

#include "Radio/CellCarriers.h"
#include "Tools/Kelvasictl/RecordText.h"

namespace kelvasi {

namespace {

using survey::CellLevel;
using survey::SeenCell;

constexpr std::array roles{CellRole::serving, CellRole::active, CellRole::neighbour, CellRole::candidate};

constexpr std::array levelsOfTables{&quantity::rsrp,     &quantity::rsrq,    &quantity::rssi,
                                    &quantity::rscp,     &quantity::ecno,    &quantity::ecio,
                                    &quantity::rxlev,    &quantity::rxPower, &quantity::carrierToInterference,
                                    &quantity::rscpLevel};
constexpr std::size_t bandsOfTables = 3;  // more say nothing any more

constexpr std::array columns{
    Column{.key = "cell", .width = 14},
    Column{.key = "bands", .width = 8},
    Column{.key = "mhz", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "network", .width = 20},
    Column{.key = "area", .width = 5, .isNumber = true},
    Column{.key = "cell_id", .width = 9, .isNumber = true},
    Column{.key = "sid"},
    Column{.key = "nid"},
    Column{.key = "roles", .width = 9},
    Column{.key = "first", .width = 8, .isTime = true},
    Column{.key = "last", .width = 8, .isTime = true},
    Column{.key = "messages"},
    Column{.key = "quantity", .width = 8},
    Column{.key = "unit", .width = 4},
    Column{.key = "count", .width = 6, .isNumber = true},
    Column{.key = "min", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "mean", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "max", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "latest"},
    Column{.key = "latest_time"},
};

template <typename Number>
Json orNull(const std::optional<Number>& number) {
  return number ? Json(*number) : Json();
}

Json known(std::int64_t number) {
  return number == CellIdentity::unknown ? Json() : Json(number);
}

void addCarriers(Json& record, const SeenCell& cell) {
  Json bands = Json::array();
  Json mhz = Json::array();
  for (const Carrier& carrier : carriersOf(cell.identity, cell.bandClass)) {
    bands.push_back(carrier.band.name);
    mhz.push_back(carrier.downlink.megahertz());
  }
  record["bands"] = std::move(bands);
  record["mhz"] = std::move(mhz);
}

Json network(const survey::CellNames& names, const Operators& operators) {
  if (!names.mcc || !names.mnc) return {};
  const auto id = networkIdFromNumbers(*names.mcc, *names.mnc);
  return id ? Json(operators.describe(*id)) : Json();
}

Json rolesOf(const SeenCell& cell) {
  Json names = Json::array();
  for (const CellRole role : roles) {
    if (cell.roles.has(role)) names.push_back(nameOf(role));
  }
  return names;
}

void addLevel(Json& record, const CellLevel& level) {
  record["unit"] = level.quantity->unit.empty() ? Json() : Json(level.quantity->unit);
  record["count"] = level.count;
  record["min"] = level.minimum;
  record["mean"] = level.mean;
  record["max"] = level.maximum;
  record["latest"] = level.last;
  record["latest_time"] = rfc3339(level.lastTime);
}

Json recordOf(const SeenCell& cell, const Operators& operators) {
  Json record;
  record["cell"] = textOf(cell.identity);
  record["rat"] = nameOf(cell.identity.family);
  record["channel"] = known(cell.identity.channel);
  record["code"] = known(cell.identity.code);
  addCarriers(record, cell);
  record["network"] = network(cell.names, operators);
  record["area"] = orNull(cell.names.area);
  record["cell_id"] = orNull(cell.names.cellId);
  record["sid"] = orNull(cell.names.sid);
  record["nid"] = orNull(cell.names.nid);
  record["roles"] = rolesOf(cell);
  record["first"] = rfc3339(cell.first);
  record["last"] = rfc3339(cell.last);
  record["messages"] = cell.count;
  return record;
}

std::vector<const SeenCell*> inOrder(const survey::Cells& cells) {
  std::vector<const SeenCell*> order;
  for (const SeenCell& cell : cells.all()) order.push_back(&cell);
  std::ranges::sort(order, {}, [](const SeenCell* cell) { return std::pair(cell->first, cell->number); });
  return order;
}

bool isShownInTables(const CellLevel& level) {
  return std::ranges::find(levelsOfTables, level.quantity) != levelsOfTables.end();
}

// On a scale from 0 to 1 a tenth says little.
void refine(Json& line, const Quantity& quantity) {
  if (quantity.most - quantity.least > 1) return;
  for (const char* key : {"min", "mean", "max"}) {
    std::array<char, 32> text;
    std::snprintf(text.data(), text.size(), "%.3f", line[key].get<double>());
    line[key] = text.data();
  }
}

// Only the first line tells of the cell, with the role that says most.
void shortenForTable(Json& line) {
  if (!line["roles"].empty()) line["roles"] = line["roles"].front();
  const std::size_t bands = line["bands"].size();
  if (bands <= bandsOfTables) return;
  line["bands"] = std::to_string(bands) + " bands";
  line["mhz"] = nullptr;
}

// A line for each level; one without a level where there is none.
std::vector<Json> levelLines(const SeenCell& cell, const Operators& operators, bool isTable) {
  Json line = recordOf(cell, operators);
  if (isTable) shortenForTable(line);
  std::vector<Json> lines;
  for (const CellLevel& level : cell.levels()) {
    if (isTable && !isShownInTables(level)) continue;
    line["quantity"] = level.quantity->id;
    addLevel(line, level);
    if (isTable) refine(line, *level.quantity);
    lines.push_back(line);
    if (isTable) line = Json::object();
  }
  if (lines.empty()) lines.push_back(std::move(line));
  return lines;
}

}  // namespace

std::vector<Json> cellRecords(const survey::Cells& cells, const Operators& operators) {
  std::vector<Json> records;
  for (const SeenCell* cell : inOrder(cells)) {
    Json& record = records.emplace_back(recordOf(*cell, operators));
    record["levels"] = Json::object();
    for (const CellLevel& level : cell->levels())
      addLevel(record["levels"][std::string(level.quantity->id)], level);
  }
  return records;
}

void printCells(const survey::Cells& cells, const Operators& operators, RecordOutput::Format format,
                RecordOutput::Print print) {
  const bool isTable = format == RecordOutput::Format::table;
  std::vector<Json> lines;
  if (format == RecordOutput::Format::ndjson) {
    lines = cellRecords(cells, operators);
  } else {
    for (const SeenCell* cell : inOrder(cells))
      std::ranges::move(levelLines(*cell, operators, isTable), std::back_inserter(lines));
  }
  const std::vector<Column> widths = fitted(columns, lines);
  RecordOutput output(format, widths, std::move(print));
  output.begin();
  for (const Json& line : lines) output.print(line);
}

}  // namespace kelvasi
